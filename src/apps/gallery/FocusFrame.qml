import QtQuick

/* Says where the keyboard is: a ring around its parent. */
Rectangle {
    anchors.fill: parent
    anchors.margins: -4
    border.color: Style.accent
    border.width: 2
    color: "transparent"
}
