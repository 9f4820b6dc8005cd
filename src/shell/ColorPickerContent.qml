import QtQuick
import Favrin.Service

/* The area of the current tab and the footer: one above the other, or side by side in the landscape layout. */
Item {
    id: content

    required property ColorPickerState colorPickerState

    readonly property bool isLandscape: colorPickerState.useLandscapeLayout
    readonly property real aspectRatio: 1.2
    readonly property real spacing: 18
    readonly property real tabWidth: isLandscape ? Math.max((width - spacing) / 2, 0) : width
    readonly property real tabHeight: tabWidth / aspectRatio
    /* All tabs have the same area. The sliders begin at its top; in a narrow one they reach beyond its bottom. */
    readonly property real overflow: sliders.visible ? Math.max(sliders.implicitHeight - tabHeight, 0) : 0
    /* A little of it the space before the footer can spare. */
    readonly property real sparedSpacing: isLandscape ? 0 : spacing / 2
    readonly property real tabBottom: tabHeight + Math.max(overflow - sparedSpacing, 0)
    /* Beside the footer nothing else keeps the tab off the edge. */
    readonly property real landscapePadding: 20

    implicitHeight: isLandscape ? Math.max(tabBottom + landscapePadding, footer.height)
                                : tabBottom + spacing + footer.height

    TabLoader {
        anchors.left: parent.left
        width: content.tabWidth
        height: content.tabHeight
        colorPickerState: content.colorPickerState
        tab: "Grid"
        file: "GridTab.qml"
    }

    TabLoader {
        anchors.left: parent.left
        width: content.tabWidth
        height: content.tabHeight
        colorPickerState: content.colorPickerState
        tab: "Spectrum"
        file: "SpectrumTab.qml"
    }

    TabLoader {
        id: sliders

        anchors.left: parent.left
        width: content.tabWidth
        colorPickerState: content.colorPickerState
        tab: "Sliders"
        file: "SlidersTab.qml"
    }

    FooterView {
        id: footer

        anchors.right: parent.right
        y: content.isLandscape ? 0 : content.tabBottom + content.spacing
        width: content.tabWidth
        colorPickerState: content.colorPickerState
    }
}
