import QtQuick
import Favrin.Gallery

/* The side panel: the embedded picker while there is one, and the messages. */
Rectangle {
    id: inspector

    required property Gallery gallery
    readonly property alias pickerPlace: pickerPlace

    readonly property bool embedded: gallery.presenter.presentation === PickerPresenter.Embedded
    /* What the picker asked for, or something like it until it has. */
    readonly property real pickerHeight: gallery.presenter.preferredContentSize.height || 400
    readonly property real heightForPicker: pickerHeight + 2 * Style.margin

    color: Style.panel

    Rectangle {
        id: card

        anchors.left: parent.left
        anchors.margins: Style.margin
        anchors.right: parent.right
        anchors.top: parent.top
        border.color: Style.separator
        border.width: 1
        color: Style.control
        height: inspector.embedded ? Math.min(inspector.pickerHeight, inspector.height - 2 * Style.margin) : 0
        radius: Style.panelRadius
        visible: inspector.embedded

        Item {
            id: pickerPlace

            anchors.fill: parent
            objectName: "pickerPlace"
        }
    }
    MessageList {
        anchors.bottom: parent.bottom
        anchors.left: parent.left
        anchors.margins: Style.margin
        anchors.right: parent.right
        anchors.top: card.bottom
        anchors.topMargin: inspector.embedded ? Style.margin : 0
        messages: inspector.gallery.messages
        visible: height > 120
    }
}
