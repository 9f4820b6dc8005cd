import QtQuick

/* A word in a pill. */
Rectangle {
    id: badge

    property bool strong: false
    property alias text: label.text

    color: strong ? Style.accent : Style.well
    height: 18
    radius: 9
    width: label.width + 14

    Label {
        id: label

        anchors.centerIn: parent
        color: badge.strong ? Style.accentText : Style.secondaryText
        font.pixelSize: 11
        font.weight: Font.Medium
    }
}
