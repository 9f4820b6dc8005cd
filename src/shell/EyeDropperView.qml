import QtQuick
import Favrin.Service
import Favrin.Shell
import Favrin.Theme

/*
 * The eyedropper button. A finger that goes down on it begins the eyedropper and may go on to the color it wants; one
 * that lifts leaves the eyedropper floating. Its face is as wide as the symbol, its touch area larger.
 */
MouseArea {
    id: button

    required property ColorPickerState colorPickerState

    readonly property real litSize: 36
    readonly property real symbolSize: Math.round(Theme.barSymbolSize * 1.2)
    readonly property bool isLit: pressed || containsMouse || keyIsDown
    property bool keyIsDown: false

    function begin() {
        colorPickerState.eyedropperShowing = true;
    }

    function letGo() {
        if (colorPickerState.eyedropperShowing)
            colorPickerState.eyedropperIsFloating = true;
    }

    implicitWidth: symbolSize
    implicitHeight: symbolSize
    // That a pointer cannot reach it is all that a disabled area says by itself.
    activeFocusOnTab: enabled
    // The finger is the eyedropper's from here on, wherever it goes.
    preventStealing: true
    hoverEnabled: true
    containmentMask: TouchMask { face: button }

    onPressed: begin()
    onReleased: letGo()
    Keys.onPressed: (event) => {
        event.accepted = [Qt.Key_Space, Qt.Key_Return, Qt.Key_Enter].includes(event.key);
        if (!event.accepted || event.isAutoRepeat)
            return;
        keyIsDown = true;
        begin();
    }
    Keys.onReleased: (event) => {
        if (!keyIsDown || event.isAutoRepeat)
            return;
        keyIsDown = false;
        letGo();
    }
    onActiveFocusChanged: {
        if (!activeFocus && keyIsDown) {
            keyIsDown = false;
            letGo();
        }
    }

    Accessible.role: Accessible.Button
    Accessible.name: ShellStrings.eyedropper
    Accessible.description: ShellStrings.eyedropperAlternatives
    Accessible.focusable: true
    Accessible.onPressAction: {
        begin();
        letGo();
    }

    Rectangle {
        anchors.centerIn: parent
        width: button.litSize
        height: width
        radius: 8
        color: Theme.fill
        visible: button.isLit
    }

    Symbol {
        anchors.fill: parent
        kind: Symbol.Eyedropper
        color: Theme.tint
    }

    FocusRing {
        parentRadius: 6
        visible: button.activeFocus
    }
}
