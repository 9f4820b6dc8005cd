pragma ComponentBehavior: Bound

import QtQuick
import Favrin.Gallery

/* What the picker said, newest first. */
Item {
    id: list

    required property MessageLog messages

    Label {
        id: heading

        anchors.left: parent.left
        font.weight: Font.Bold
        height: Style.controlHeight
        text: qsTr("Messages")
    }
    Label {
        anchors.left: heading.right
        anchors.leftMargin: Style.gap
        height: Style.controlHeight
        secondary: true
        text: list.messages.count
        visible: list.messages.count > 0
    }
    PushButton {
        anchors.right: parent.right
        objectName: "clearButton"
        text: qsTr("Clear")
        visible: list.messages.count > 0

        onClicked: list.messages.clear()
    }
    ListView {
        anchors.bottom: parent.bottom
        anchors.left: parent.left
        anchors.right: parent.right
        anchors.top: heading.bottom
        anchors.topMargin: Style.gap
        boundsBehavior: Flickable.StopAtBounds
        clip: true
        model: list.messages
        objectName: "messageList"

        delegate: MessageRow {
            width: ListView.view.width
        }
    }
    Label {
        anchors.left: parent.left
        anchors.right: parent.right
        anchors.top: heading.bottom
        lineHeight: 1.3
        secondary: true
        text: qsTr("Colors that you pick are listed here, the newest first.")
        visible: list.messages.count === 0
        wrapMode: Text.Wrap
    }
}
