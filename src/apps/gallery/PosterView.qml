pragma ComponentBehavior: Bound

import QtQuick
import Favrin.Gallery

/* The poster itself, as large as fits; touching a part selects it. */
Item {
    id: view

    required property Poster poster
    readonly property real unit: sheet.width / 600

    Item {
        id: sheet

        anchors.centerIn: parent
        height: Math.round(width * 1.4)
        width: Math.floor(Math.min(view.width, view.height / 1.4))

        SheetShadow {
            anchors.fill: parent
        }
        Repeater {
            model: view.poster

            PosterShape {
                id: shape

                required color
                required property string name
                required part

                anchors.fill: parent
                // The sun's reflection lies on the water.
                z: part === Poster.Sun ? 1 : 0

                TapHandler {
                    gesturePolicy: TapHandler.ReleaseWithinBounds

                    onTapped: view.poster.selectedPart = shape.part
                }
            }
        }
        PosterLettering {
            anchors.fill: parent
            z: 2
            ink: view.poster.ink
            paper: view.poster.paper
            unit: view.unit

            onTapped: view.poster.selectedPart = Poster.Ink
        }
    }
}
