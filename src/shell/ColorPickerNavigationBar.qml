import QtQuick
import Favrin.Service
import Favrin.Shell
import Favrin.Theme

/* The title, and the close button at its trailing end. */
Item {
    id: bar

    required property ColorPickerState colorPickerState

    readonly property real smallestGap: 10

    implicitHeight: 55

    Text {
        anchors.centerIn: parent
        width: Math.min(implicitWidth, bar.width - 2 * (close.width + bar.smallestGap))
        text: bar.colorPickerState.title
        textFormat: Text.PlainText
        maximumLineCount: 1
        elide: Text.ElideRight
        font: Theme.headlineFont
        color: Theme.label
        Accessible.role: Accessible.Heading
        Accessible.name: text
    }

    SystemCloseButton {
        id: close

        anchors.right: parent.right
        anchors.verticalCenter: parent.verticalCenter
        label: ShellStrings.close
        // Hidden, it keeps its room, so that the title stays where it is.
        opacity: enabled ? 1 : 0
        enabled: !bar.colorPickerState.isPopover && !bar.colorPickerState.isEmbedded
        Accessible.ignored: !enabled
        onClicked: bar.colorPickerState.performClose()
    }
}
