import QtQuick
import Favrin.Gallery

/* One message: what it was, the color where it has one, and its number. */
Item {
    id: row

    required property color color
    required property string detail
    required property int kind
    required property int number
    required property string title

    readonly property bool isPick: kind === MessageLog.VolatilePick || kind === MessageLog.FinalPick
    readonly property bool isFinal: kind === MessageLog.FinalPick

    Accessible.name: title + ", " + detail
    Accessible.role: Accessible.ListItem
    implicitHeight: 52

    Swatch {
        id: swatch

        anchors.left: parent.left
        anchors.verticalCenter: parent.verticalCenter
        color: row.color
        visible: row.isPick
    }
    Rectangle {
        anchors.centerIn: swatch
        color: row.kind === MessageLog.Failure ? Style.warning : Style.secondaryText
        height: 8
        radius: 4
        visible: !row.isPick
        width: 8
    }
    Column {
        anchors.left: swatch.right
        anchors.leftMargin: 12
        anchors.right: count.left
        anchors.rightMargin: Style.gap
        anchors.verticalCenter: parent.verticalCenter
        spacing: 2

        Row {
            anchors.left: parent.left
            spacing: Style.gap

            Label {
                font.weight: Font.DemiBold
                text: row.title
            }
            Badge {
                anchors.verticalCenter: parent.verticalCenter
                strong: row.isFinal
                text: row.isFinal ? qsTr("final") : qsTr("volatile")
                visible: row.isPick
            }
        }
        Label {
            font.pixelSize: Style.captionSize
            secondary: true
            text: row.detail
            visible: row.detail.length > 0
            width: parent.width
        }
    }
    Label {
        id: count

        anchors.right: parent.right
        anchors.verticalCenter: parent.verticalCenter
        font.pixelSize: Style.captionSize
        secondary: true
        text: row.number
    }
}
