import QtQuick
import QtQuick.Templates as T
import Favrin.Theme

/* One choice of the color space menu. */
T.MenuItem {
    id: item

    required property bool isCurrent
    required property real sidePadding

    implicitWidth: label.implicitWidth + mark.width + 3 * sidePadding
    hoverEnabled: true

    Accessible.role: Accessible.RadioButton
    Accessible.name: text
    Accessible.checkable: true
    Accessible.checked: isCurrent
    Accessible.onPressAction: item.triggered()

    Item {
        anchors.fill: parent
        Text {
            id: label

            anchors.left: parent.left
            anchors.right: mark.left
            anchors.margins: item.sidePadding
            anchors.verticalCenter: parent.verticalCenter
            text: item.text
            textFormat: Text.PlainText
            elide: Text.ElideRight
            font: Theme.bodyFont
            color: Theme.label
        }

        Symbol {
            id: mark

            kind: Symbol.CheckMark
            anchors.right: parent.right
            anchors.rightMargin: item.sidePadding
            anchors.verticalCenter: parent.verticalCenter
            width: Theme.bodyFont.pixelSize * 0.8
            height: width
            color: Theme.tint
            visible: item.isCurrent
        }
    }

    background: Item {
        Rectangle {
            width: parent.width
            height: 1
            color: Theme.separator
        }

        Rectangle {
            anchors.fill: parent
            anchors.margins: 3
            radius: 5
            color: Theme.fill
            visible: item.highlighted || item.hovered || item.down
        }
    }
}
