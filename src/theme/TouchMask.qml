import QtQuick

/* What of an item can be touched: as much as a finger needs, about its middle. To be its containment mask. */
Item {
    /* The item. */
    required property Item face
    readonly property real least: 44

    x: (face.width - width) / 2
    y: (face.height - height) / 2
    width: Math.max(face.width, least)
    height: Math.max(face.height, least)
}
