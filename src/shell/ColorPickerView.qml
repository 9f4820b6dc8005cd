import QtQuick
import Favrin.Service
import Favrin.Theme

/* The root view: everything scrolls together when it is higher than the window. */
Flickable {
    id: root

    required property ColorPickerState colorPickerState

    readonly property real horizontalPadding: colorPickerState.useLandscapeLayout ? 20 : 16
    readonly property bool fits: contentHeight <= height

    implicitWidth: contentWidth
    implicitHeight: contentHeight
    contentWidth: colorPickerState.size.width
    contentHeight: stack.height
    flickableDirection: Flickable.VerticalFlick
    boundsBehavior: fits ? Flickable.StopAtBounds : Flickable.DragAndOvershootBounds
    interactive: !fits
    pixelAligned: true

    LayoutMirroring.enabled: Theme.isMirrored
    LayoutMirroring.childrenInherit: true
    Accessible.role: Accessible.Pane
    Accessible.name: colorPickerState.title

    Keys.onEscapePressed: colorPickerState.performClose()

    Column {
        id: stack

        x: root.horizontalPadding
        width: Math.max(root.contentWidth - 2 * root.horizontalPadding, 0)

        ColorPickerNavigationBar {
            width: parent.width
            colorPickerState: root.colorPickerState
        }

        ColorPickerContent {
            width: parent.width
            colorPickerState: root.colorPickerState
        }
    }
}
