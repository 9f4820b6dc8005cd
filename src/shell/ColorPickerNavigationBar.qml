import QtQuick
import Favrin.Service
import Favrin.Shell
import Favrin.Theme

/*
 * The eyedropper button, the title, and the close button. A button that is hidden keeps its room, so that the title
 * stays where it is: in the middle of what the buttons leave.
 */
Item {
    id: bar

    required property ColorPickerState colorPickerState

    readonly property real smallestGap: 10

    implicitHeight: 55

    EyeDropperView {
        id: eyedropper

        anchors.left: parent.left
        anchors.verticalCenter: parent.verticalCenter
        colorPickerState: bar.colorPickerState
        opacity: enabled ? 1 : 0
        enabled: bar.colorPickerState.showsEyedropper
        Accessible.ignored: !enabled
    }

    Item {
        anchors.left: eyedropper.right
        anchors.leftMargin: bar.smallestGap
        anchors.right: close.left
        anchors.rightMargin: bar.smallestGap
        anchors.verticalCenter: parent.verticalCenter
        height: title.height

        Text {
            id: title

            anchors.horizontalCenter: parent.horizontalCenter
            width: Math.min(implicitWidth, parent.width)
            text: bar.colorPickerState.title
            textFormat: Text.PlainText
            maximumLineCount: 1
            elide: Text.ElideRight
            font: Theme.headlineFont
            color: Theme.label
            Accessible.role: Accessible.Heading
            Accessible.name: text
        }
    }

    SystemCloseButton {
        id: close

        anchors.right: parent.right
        anchors.verticalCenter: parent.verticalCenter
        label: ShellStrings.close
        opacity: enabled ? 1 : 0
        enabled: !bar.colorPickerState.isPopover && !bar.colorPickerState.isEmbedded
        Accessible.ignored: !enabled
        onTriggered: bar.colorPickerState.performClose()
    }
}
