import QtQuick
import Favrin.Gallery

/* The words on the poster: a headline in ink, the small print in the color of the paper. */
Item {
    id: lettering

    required property color ink
    required property color paper
    required property real unit

    signal tapped

    component Line: Text {
        font.family: Style.family
        horizontalAlignment: Text.AlignLeft
        textFormat: Text.PlainText
    }

    // Letters stay where they are printed, whichever way the app reads.
    LayoutMirroring.enabled: false
    LayoutMirroring.childrenInherit: true

    Line {
        color: lettering.ink
        font.family: Style.displayFamily
        font.letterSpacing: -3.5 * lettering.unit
        font.pixelSize: Math.max(1, Math.round(112 * lettering.unit))
        font.weight: Font.Black
        lineHeight: 0.84
        text: qsTr("Lakeside\nNights")
        x: 44 * lettering.unit
        y: 26 * lettering.unit

        TapHandler {
            gesturePolicy: TapHandler.ReleaseWithinBounds

            onTapped: lettering.tapped()
        }
    }
    Line {
        color: lettering.paper
        font.pixelSize: Math.max(1, Math.round(27 * lettering.unit))
        font.weight: Font.DemiBold
        text: qsTr("Chamber music\nby the water")
        x: 44 * lettering.unit
        y: 706 * lettering.unit
    }
    Line {
        color: lettering.paper
        font.pixelSize: Math.max(1, Math.round(16 * lettering.unit))
        font.weight: Font.Medium
        horizontalAlignment: Text.AlignRight
        lineHeight: 1.25
        text: qsTr("12 – 21 June\nEvery evening at eight\nBoathouse stage")
        width: (600 - 88) * lettering.unit
        x: 44 * lettering.unit
        y: 708 * lettering.unit
    }
}
