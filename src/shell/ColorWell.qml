import QtQuick
import Favrin.Shell
import Favrin.Theme

/* The well, its focus ring, and the menu that copies its color: by a long press, the other mouse button or the keys. */
ColorWellBridge {
    id: well

    function openMenu() {
        if (colorPickerState.hasSelectedColor)
            menu.openAt(well, Qt.rect(0, 0, width, height));
    }

    Accessible.role: Accessible.Graphic
    Keys.onMenuPressed: openMenu()

    TapHandler {
        onLongPressed: well.openMenu()
    }

    TapHandler {
        acceptedButtons: Qt.RightButton
        onTapped: well.openMenu()
    }

    CalloutLoader {
        id: menu

        command: ShellStrings.copy
        onTriggered: well.copy()
        onClosed: well.forceActiveFocus(Qt.PopupFocusReason)
    }

    FocusRing {
        parentRadius: well.cornerRadius
        visible: well.focusVisible
    }
}
