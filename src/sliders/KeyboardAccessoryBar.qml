import QtQuick
import QtQuick.Templates as T
import Favrin.Sliders
import Favrin.Theme

/* Above a keyboard that has no key for it: the button that ends the editing. */
Rectangle {
    id: bar

    required property CPTextFieldCoordinator coordinator

    // The lower edge of what scrolls is the upper edge of the keyboard.
    parent: coordinator.viewport
    anchors.left: parent?.left
    anchors.right: parent?.right
    anchors.bottom: parent?.bottom
    implicitHeight: 44
    z: 1
    color: Theme.systemGray5

    T.AbstractButton {
        id: button

        anchors.right: parent.right
        anchors.rightMargin: 8
        anchors.verticalCenter: parent.verticalCenter
        implicitWidth: label.implicitWidth + 16
        implicitHeight: 44
        // Taking the focus would end the editing before the click does.
        focusPolicy: Qt.NoFocus
        Accessible.role: Accessible.Button
        Accessible.name: bar.coordinator.doneLabel
        Accessible.onPressAction: button.clicked()
        onClicked: bar.coordinator.endEditing()

        Text {
            id: label

            anchors.fill: parent
            horizontalAlignment: Text.AlignHCenter
            verticalAlignment: Text.AlignVCenter
            text: bar.coordinator.doneLabel
            textFormat: Text.PlainText
            font: Theme.headlineFont
            color: Theme.tint
            opacity: button.pressed ? 0.5 : 1
            Accessible.ignored: true
        }
    }
}
