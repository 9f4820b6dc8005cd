import QtQuick
import Favrin.Service
import Favrin.Sliders
import Favrin.Theme

/* One component of the selected color: its name above a track and a field with its value. */
Item {
    id: row

    required property ColorPickerState colorPickerState
    /* A ColorComponent. */
    required property int component

    readonly property real titleGap: 5
    readonly property real fieldGap: 16

    implicitHeight: title.height + titleGap + slider.height

    Text {
        id: title

        anchors.left: parent.left
        text: slider.title
        textFormat: Text.PlainText
        font.family: Theme.footnoteFont.family
        font.pixelSize: Theme.footnoteFont.pixelSize
        font.weight: Font.DemiBold
        color: Theme.secondaryLabel
        Accessible.ignored: true
    }

    CPSlider {
        id: slider

        anchors.left: parent.left
        anchors.right: field.left
        anchors.rightMargin: row.fieldGap
        anchors.bottom: parent.bottom
        colorPickerState: row.colorPickerState
        component: row.component
        containmentMask: TouchMask { face: slider }
        Accessible.role: Accessible.Slider

        SliderTrack {
            anchors.fill: parent
            colorPickerState: row.colorPickerState
            component: row.component
        }

        FocusRing {
            parentRadius: slider.height / 2
            visible: slider.focusVisible
        }

        SliderThumb {
            x: slider.thumbCenter.x - width / 2
            width: slider.height
            height: slider.height
            colorPickerState: row.colorPickerState

            Behavior on x {
                enabled: row.colorPickerState.animatesChanges && !Theme.reduceMotion
                NumberAnimation { duration: 350; easing.type: Easing.InOutQuad }
            }
        }
    }

    CPTextField {
        id: field

        anchors.right: parent.right
        anchors.bottom: parent.bottom
        width: row.colorPickerState.useLandscapeLayout ? 70 : 76
        height: slider.height
        colorPickerState: row.colorPickerState
        coordinator: ComponentFieldCoordinator {
            colorPickerState: row.colorPickerState
            component: row.component
        }
    }
}
