pragma ComponentBehavior: Bound

import QtQuick
import QtQuick.Templates as T

/* One of a few words. */
Rectangle {
    id: choice

    required property list<string> words
    property int current: 0

    signal chosen(int index)

    color: Style.well
    implicitHeight: Style.controlHeight
    implicitWidth: row.width + 6
    radius: Style.controlRadius

    Row {
        id: row

        anchors.centerIn: parent

        Repeater {
            model: choice.words

            T.AbstractButton {
                id: segment

                required property int index
                required property string modelData

                checked: index === choice.current
                height: choice.height - 6
                leftPadding: 14
                objectName: "segment" + modelData
                rightPadding: 14
                text: modelData
                width: implicitContentWidth + leftPadding + rightPadding

                onClicked: choice.chosen(index)

                background: Rectangle {
                    color: segment.checked ? Style.control : "transparent"
                    radius: Style.controlRadius - 3

                    FocusFrame {
                        radius: parent.radius + 4
                        visible: segment.visualFocus
                    }
                }
                contentItem: Label {
                    font.weight: segment.checked ? Font.DemiBold : Font.Normal
                    secondary: !segment.checked
                    text: segment.text
                }
            }
        }
    }
}
