import QtQuick

/* A color as a small disc; a stroke across it where there is none. */
Rectangle {
    id: swatch

    property int size: 24

    border.color: Style.separator
    border.width: 1
    height: size
    radius: size / 2
    width: size

    Rectangle {
        anchors.centerIn: parent
        color: Style.warning
        height: 2
        rotation: -45
        visible: swatch.color.a === 0
        width: swatch.size
    }
}
