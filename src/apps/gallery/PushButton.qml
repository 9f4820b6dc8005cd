import QtQuick
import QtQuick.Templates as T

/* A button with a text and, where a color is its subject, a swatch before it. */
T.AbstractButton {
    id: button

    property bool prominent: false
    property bool showsSwatch: false
    property color swatch

    readonly property color face: prominent ? Style.accent : Style.control
    readonly property color pressedFace: prominent ? Style.pressedAccent : Style.pressedControl

    implicitHeight: Style.controlHeight
    implicitWidth: implicitContentWidth + leftPadding + rightPadding
    leftPadding: showsSwatch ? 12 : 18
    rightPadding: 18

    background: Rectangle {
        border.color: Style.separator
        border.width: button.prominent ? 0 : 1
        color: button.down || button.checked ? button.pressedFace : button.face
        radius: Style.controlRadius

        FocusFrame {
            radius: parent.radius + 4
            visible: button.visualFocus
        }
    }
    contentItem: Row {
        spacing: Style.gap

        Swatch {
            anchors.verticalCenter: parent.verticalCenter
            color: button.swatch
            size: 20
            visible: button.showsSwatch
        }
        Label {
            anchors.verticalCenter: parent.verticalCenter
            color: button.prominent ? Style.accentText : Style.text
            font.weight: Font.DemiBold
            text: button.text
        }
    }
}
