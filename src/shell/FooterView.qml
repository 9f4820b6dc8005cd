import QtQuick
import Favrin.Favorites
import Favrin.Service
import Favrin.Sliders
import Favrin.Theme

/* Below every tab: the opacity, and the well with the selected color beside the favorites and their pages. */
Item {
    id: footer

    required property ColorPickerState colorPickerState

    readonly property bool isLandscape: colorPickerState.useLandscapeLayout
    readonly property bool hasPages: favoriteColorPickerModel.numberOfPages >= 2
    readonly property real rowSpacing: 22
    readonly property real wellSpacing: isLandscape ? 20 : 16
    readonly property real pageControlSpacing: 8
    readonly property real bottomPadding: hasPages ? 5 : isLandscape ? 20 : 16
    readonly property real wellTop: colorPickerState.showsAlpha ? divider.y + divider.height + rowSpacing : 0

    implicitHeight: wellTop + Math.max(well.height, favorites.height) + bottomPadding
    height: implicitHeight

    ColorSlider {
        id: opacity

        width: parent.width
        visible: footer.colorPickerState.showsAlpha
        colorPickerState: footer.colorPickerState
        component: ColorComponent.Opacity
    }

    Divider {
        id: divider

        y: opacity.height + footer.rowSpacing
        width: parent.width
        visible: opacity.visible
    }

    ColorWell {
        id: well

        anchors.left: parent.left
        y: footer.wellTop
        width: fitting.stripHeight
        height: fitting.stripHeight
        colorPickerState: footer.colorPickerState
    }

    FavoriteColorPickerModel {
        id: favoriteColorPickerModel
    }

    StripFitting {
        id: fitting

        availableWidth: favorites.width
        useLandscapeLayout: footer.isLandscape
    }

    Item {
        id: favorites

        anchors.left: well.right
        anchors.leftMargin: footer.wellSpacing
        anchors.right: parent.right
        y: footer.wellTop
        height: footer.hasPages ? pageControl.y + pageControl.height : strip.height

        FavoriteColorPickerView {
            id: strip

            x: fitting.inset
            width: parent.width - 2 * fitting.inset
            height: fitting.stripHeight
            colorPickerState: footer.colorPickerState
            model: favoriteColorPickerModel
            swatchesPerPage: fitting.swatchesPerPage
            Accessible.role: Accessible.List
        }

        PageControl {
            id: pageControl

            y: strip.height + footer.pageControlSpacing
            width: parent.width
            height: implicitHeight
            visible: footer.hasPages
            favoriteColorPickerModel: favoriteColorPickerModel
        }
    }
}
