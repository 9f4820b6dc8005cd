import QtQuick
import Favrin.Theme

/* The round close button. Its touch area is larger than its face. */
MouseArea {
    id: button

    /* What the button is called. */
    required property string label

    readonly property real diameter: Math.round(Theme.barSymbolSize * 30 / 17)
    readonly property bool isPressed: containsPress || spaceIsDown
    property bool spaceIsDown: false

    /* The user wants what the button does. */
    signal triggered()

    implicitWidth: diameter
    implicitHeight: diameter
    // That a pointer cannot reach it is all that a disabled area says by itself.
    activeFocusOnTab: enabled
    hoverEnabled: true
    containmentMask: TouchMask { face: button }

    onClicked: triggered()
    onActiveFocusChanged: spaceIsDown = false
    Keys.onReturnPressed: triggered()
    Keys.onEnterPressed: triggered()
    Keys.onSpacePressed: (event) => spaceIsDown = spaceIsDown || !event.isAutoRepeat
    Keys.onReleased: (event) => {
        event.accepted = event.key === Qt.Key_Space && spaceIsDown && !event.isAutoRepeat;
        if (!event.accepted)
            return;
        spaceIsDown = false;
        triggered();
    }

    Accessible.role: Accessible.Button
    Accessible.name: label
    Accessible.focusable: true
    Accessible.onPressAction: triggered()

    Item {
        anchors.fill: parent
        opacity: button.isPressed ? 0.5 : 1

        Symbol {
            anchors.fill: parent
            kind: Symbol.Disc
            color: Theme.fill
        }

        Symbol {
            anchors.fill: parent
            kind: Symbol.Disc
            color: Theme.fill
            visible: button.containsMouse && !button.isPressed
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
        visible: button.activeFocus
    }
}
