import QtQuick
import Favrin.Grid
import Favrin.Service
import Favrin.Theme

/* The area of the current tab. */
Item {
    id: content

    required property ColorPickerState colorPickerState

    readonly property real aspectRatio: 1.2

    implicitHeight: width / aspectRatio

    ColorSwatchPickerView {
        id: grid

        anchors.fill: parent
        colorPickerState: content.colorPickerState
        Accessible.role: Accessible.List

        FocusRing {
            parentRadius: grid.cornerRadius
            visible: grid.focusVisible
        }
    }
}
