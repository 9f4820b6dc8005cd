pragma ComponentBehavior: Bound

import QtQuick
import QtQuick.Templates as T
import Favrin.Gallery

/* The parts of the poster with their fills; one is selected. */
Row {
    id: strip

    required property Poster poster

    spacing: 4

    Repeater {
        model: strip.poster

        T.AbstractButton {
            id: button

            required property color color
            required property string name
            required property int part

            checked: strip.poster.selectedPart === part
            height: 68
            objectName: "part" + name
            text: name
            width: 62

            onClicked: strip.poster.selectedPart = part

            background: Rectangle {
                color: button.checked ? Style.control : "transparent"
                radius: Style.controlRadius

                FocusFrame {
                    radius: parent.radius + 4
                    visible: button.visualFocus
                }
            }
            contentItem: Item {
                Swatch {
                    anchors.horizontalCenter: parent.horizontalCenter
                    color: button.color
                    size: 30
                    y: 9
                }
                Label {
                    anchors.bottom: parent.bottom
                    anchors.bottomMargin: 7
                    anchors.horizontalCenter: parent.horizontalCenter
                    font.pixelSize: Style.captionSize
                    font.weight: button.checked ? Font.DemiBold : Font.Normal
                    secondary: !button.checked
                    text: button.name
                }
            }
        }
    }
}
