import QtQuick
import Favrin.Service
import Favrin.Sliders
import Favrin.Theme

/* One line of text in a field of its own; its coordinator decides what is shown and what may be typed. */
FieldBackground {
    id: field

    required property ColorPickerState colorPickerState
    required property CPTextFieldCoordinator coordinator

    readonly property real padding: 4
    readonly property int pixelSize: Theme.bodyFont.pixelSize
    readonly property string widestLetter: "W"
    /* Short texts need no measuring, which would take a good part of every step of a drag. */
    readonly property bool fits: input.width <= 0 || (input.length + 1) * widest.advanceWidth <= input.width
                                 || metrics.advanceWidth <= input.width

    /* Where fingers type on the screen itself, with no room for a keyboard that closes by itself. */
    property bool isPhone: Math.min(Screen.width, Screen.height) < 600
    property bool isKeyboardVisible: coordinator.isKeyboardVisible

    implicitHeight: 36
    color: colorPickerState.hasSelectedColor ? Theme.systemBackground : Theme.systemGray5

    TextInput {
        id: input

        anchors.fill: parent
        anchors.leftMargin: field.padding
        anchors.rightMargin: field.padding
        horizontalAlignment: TextInput.AlignHCenter
        verticalAlignment: TextInput.AlignVCenter
        clip: true
        containmentMask: TouchMask { face: input }
        selectByMouse: true
        activeFocusOnTab: true
        font.family: Theme.bodyFont.family
        font.pixelSize: field.fits ? field.pixelSize : Math.floor(field.pixelSize * width / metrics.advanceWidth)
        font.weight: Font.Medium
        color: field.colorPickerState.hasSelectedColor ? Theme.label : Theme.tertiaryLabel
        selectionColor: Theme.tint
        selectedTextColor: Theme.systemBackground
        validator: field.coordinator.editQuestion
        inputMethodHints: field.coordinator.inputMethodHints
        EnterKey.type: Qt.EnterKeyDone

        Accessible.role: Accessible.EditableText
        Accessible.name: field.coordinator.name

        onTextEdited: field.coordinator.textFieldValueChanged()
        onActiveFocusChanged: field.coordinator.setEditing(activeFocus)
        onCursorPositionChanged: field.coordinator.selectionChanged()
        onSelectionStartChanged: field.coordinator.selectionChanged()
        onSelectionEndChanged: field.coordinator.selectionChanged()
        onAccepted: field.coordinator.endEditing()
        Component.onCompleted: field.coordinator.field = input
    }

    /* The text at its proper size; a large one is made smaller until all of it is seen. */
    TextMetrics {
        id: metrics

        font.family: Theme.bodyFont.family
        font.pixelSize: field.pixelSize
        font.weight: Font.Medium
        text: input.text + "0"
    }

    TextMetrics {
        id: widest

        font: metrics.font
        text: field.widestLetter
    }

    FocusRing {
        parentRadius: field.cornerRadius
        visible: input.activeFocus
    }

    Loader {
        readonly property bool isWanted: field.isPhone && field.isKeyboardVisible && field.coordinator.isDecimalPad
                                         && input.activeFocus

        onIsWantedChanged: isWanted ? setSource("KeyboardAccessoryBar.qml", { coordinator: field.coordinator })
                                    : setSource("")
    }
}
