import QtQuick
import Favrin.Favorites

/* Shows and turns the pages of the strip: a tap goes to a dot's page, a drag along the dots through the pages. */
PageControlBridge {
    id: indicator

    implicitHeight: 26

    Accessible.role: Accessible.Slider
    Accessible.name: FavoritesStrings.favorites
    Accessible.onIncreaseAction: value += 1
    Accessible.onDecreaseAction: value -= 1

    // As high as a finger needs.
    readonly property real touchMargin: Math.max(44 - height, 0) / 2

    TapHandler {
        margin: indicator.touchMargin
        onTapped: (eventPoint) => indicator.tap(eventPoint.position.x)
    }

    DragHandler {
        target: null
        margin: indicator.touchMargin
        yAxis.enabled: false
        onActiveChanged: {
            if (active)
                indicator.beginDrag();
        }
        onTranslationChanged: {
            if (active)
                indicator.drag(translation.x);
        }
    }
}
