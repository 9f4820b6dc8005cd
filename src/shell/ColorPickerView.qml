import QtQuick
import Favrin.Service
import Favrin.Shell
import Favrin.Theme

/* The root view: everything scrolls together when it is higher than the window. */
Flickable {
    id: root

    required property ColorPickerState colorPickerState

    readonly property real horizontalPadding: colorPickerState.useLandscapeLayout ? 20 : 16
    readonly property real innerWidth: Math.max(contentWidth - 2 * horizontalPadding, 0)
    readonly property real spacing: colorPickerState.useLandscapeLayout ? 16 : 20
    readonly property bool fits: contentHeight <= height
    function revealFocus() {
        if (!moving)
            contentY = reveal.position(contentY, height, contentHeight);
    }

    implicitWidth: contentWidth
    implicitHeight: contentHeight
    contentWidth: colorPickerState.size.width
    contentHeight: content.y + content.height
    flickableDirection: Flickable.VerticalFlick
    boundsBehavior: fits ? Flickable.StopAtBounds : Flickable.DragAndOvershootBounds
    interactive: !fits
    pixelAligned: true

    LayoutMirroring.enabled: Theme.isMirrored
    LayoutMirroring.childrenInherit: true
    Accessible.role: Accessible.Pane
    Accessible.name: colorPickerState.title

    onHeightChanged: revealFocus()
    Window.onActiveFocusItemChanged: revealFocus()
    Keys.onEscapePressed: colorPickerState.performClose()

    FocusReveal {
        id: reveal

        content: root.contentItem
    }

    // Bindings, not a positioner: the height must be known before anything is shown.
    ColorPickerNavigationBar {
        id: bar

        x: root.horizontalPadding
        width: root.innerWidth
        colorPickerState: root.colorPickerState
    }

    ColorPickerTabPicker {
        id: tabPicker

        x: root.horizontalPadding
        y: bar.height
        width: root.innerWidth
        colorPickerState: root.colorPickerState
    }

    ColorPickerContent {
        id: content

        x: root.horizontalPadding
        y: tabPicker.y + tabPicker.height + root.spacing
        width: root.innerWidth
        colorPickerState: root.colorPickerState
    }
}
