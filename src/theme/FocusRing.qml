import QtQuick
import Favrin.Theme

/* Says where the keyboard is: a ring around its parent, some distance off so that it is no marker. */
Rectangle {
    /* Corner radius of the parent. */
    required property real parentRadius
    readonly property real gap: 2

    anchors.fill: parent
    anchors.margins: -(gap + border.width)
    radius: parentRadius + gap + border.width
    color: "transparent"
    border.color: Theme.tint
    border.width: Theme.increaseContrast ? 3 : 2
}
