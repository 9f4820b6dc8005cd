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

    TapHandler {
        onTapped: (eventPoint) => indicator.tap(eventPoint.position.x)
    }

    DragHandler {
        target: null
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
