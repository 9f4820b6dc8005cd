import QtQuick
import QtQuick.Templates as T
import Favrin.Theme

/* The round close button. Its touch area is larger than its face. */
T.AbstractButton {
    id: button

    /* What the button is called. */
    required property string label

    readonly property real diameter: Math.round(Theme.barSymbolSize * 30 / 17)

    implicitWidth: diameter
    implicitHeight: diameter
    focusPolicy: Qt.StrongFocus
    hoverEnabled: true
    containmentMask: TouchMask { face: button }

    Accessible.role: Accessible.Button
    Accessible.name: label
    Accessible.onPressAction: button.clicked()
    Keys.onReturnPressed: button.clicked()
    Keys.onEnterPressed: button.clicked()

    background: Item {
        opacity: button.pressed ? 0.5 : 1

        Symbol {
            anchors.fill: parent
            kind: Symbol.Disc
            color: Theme.fill
        }

        Symbol {
            anchors.fill: parent
            kind: Symbol.Disc
            color: Theme.fill
            visible: button.hovered && !button.pressed
        }

        Symbol {
            anchors.centerIn: parent
            width: Math.round(button.diameter * 0.4)
            height: width
            kind: Symbol.Cross
            color: Theme.secondaryLabel
        }
    }

    FocusRing {
        parentRadius: button.diameter / 2
        visible: button.visualFocus
    }
}
