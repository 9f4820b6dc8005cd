import QtQuick
import QtQuick.Templates as T
import Favrin.Service
import Favrin.Sliders
import Favrin.Theme

/* Names the color space of the hex code that follows it, and opens the menu that changes it. */
T.AbstractButton {
    id: button

    required property ColorPickerState colorPickerState
    required property real largestWidth

    readonly property real indicatorRoom: indicator.width + 5
    readonly property bool hasRoom: label.implicitWidth + indicatorRoom <= largestWidth

    implicitWidth: hasRoom ? label.implicitWidth + indicatorRoom : Math.min(label.implicitWidth, largestWidth)
    implicitHeight: Math.max(label.implicitHeight, 36)
    enabled: colorPickerState.hasSelectedColor
    focusPolicy: Qt.StrongFocus
    containmentMask: TouchMask { face: button }

    Accessible.role: Accessible.ButtonMenu
    Accessible.name: switcher.label
    Accessible.onPressAction: button.clicked()
    Keys.onReturnPressed: button.clicked()
    Keys.onEnterPressed: button.clicked()
    Keys.onDownPressed: button.clicked()
    onClicked: menu.visible ? menu.close() : menu.open()

    ColorSpaceSwitcher {
        id: switcher

        colorPickerState: button.colorPickerState
    }

    Item {
        anchors.fill: parent
        opacity: button.pressed ? 0.5 : 1

        Text {
            id: label

            anchors.left: parent.left
            anchors.right: parent.right
            anchors.rightMargin: button.hasRoom ? button.indicatorRoom : 0
            anchors.verticalCenter: parent.verticalCenter
            // The sign before the digits is not left alone on a line.
            text: switcher.label.replace(/ #$/, "\u00a0#")
            textFormat: Text.PlainText
            wrapMode: Text.Wrap
            horizontalAlignment: Text.AlignRight
            font: Theme.bodyFont
            color: button.enabled ? Theme.tint : Theme.tertiaryLabel
            Accessible.ignored: true
        }

        Symbol {
            id: indicator

            kind: Symbol.UpDownChevrons
            anchors.right: parent.right
            anchors.verticalCenter: parent.verticalCenter
            width: Theme.bodyFont.pixelSize * 0.5
            height: Theme.bodyFont.pixelSize * 0.75
            color: label.color
            visible: button.hasRoom
        }
    }

    FocusRing {
        parentRadius: 6
        visible: button.visualFocus
    }

    ColorSpaceMenu {
        id: menu

        x: Theme.isMirrored ? 0 : button.width - width
        y: button.height
        switcher: switcher
        onClosed: {
            // The menu leaves the keyboard to the window as a whole, unless a press gave it to something else.
            const holder = button.Window.activeFocusItem
            if (!holder || !holder.parent)
                button.forceActiveFocus(Qt.PopupFocusReason)
        }
    }
}
