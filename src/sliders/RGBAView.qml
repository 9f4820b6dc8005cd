import QtQuick
import Favrin.Service
import Favrin.Sliders

/* The content of the sliders tab: red, green and blue, and the hex code with its color space. */
Item {
    id: view

    required property ColorPickerState colorPickerState

    readonly property real rowGap: 18
    readonly property real hexRowGap: 25
    readonly property real hexFieldGap: 16

    readonly property real hexRowTop: blue.y + blue.height + hexRowGap
    readonly property real hexRowHeight: Math.max(hex.height, spaceButton.height)

    implicitHeight: hexRowTop + hexRowHeight

    ColorSlider {
        id: red

        width: parent.width
        colorPickerState: view.colorPickerState
        component: ColorComponent.Red
    }

    ColorSlider {
        id: green

        y: red.height + view.rowGap
        width: parent.width
        colorPickerState: view.colorPickerState
        component: ColorComponent.Green
    }

    ColorSlider {
        id: blue

        y: green.y + green.height + view.rowGap
        width: parent.width
        colorPickerState: view.colorPickerState
        component: ColorComponent.Blue
    }

    ColorSpaceButton {
        id: spaceButton

        anchors.verticalCenter: hex.verticalCenter
        anchors.right: hex.left
        anchors.rightMargin: view.hexFieldGap
        largestWidth: view.width - hex.width - view.hexFieldGap
        colorPickerState: view.colorPickerState
    }

    CPTextField {
        id: hex

        anchors.right: parent.right
        y: view.hexRowTop + (view.hexRowHeight - height) / 2
        width: 100
        colorPickerState: view.colorPickerState
        coordinator: HexFieldCoordinator { colorPickerState: view.colorPickerState }
    }
}
