import QtQuick
import QtQuick.Templates as T
import Favrin.Favorites
import Favrin.Theme

/* The delete command, above the cell it is for. It lies in the scene: a window of its own would be dismissed at once. */
T.Menu {
    id: menu

    signal deleteRequested

    readonly property real rowHeight: Math.max(40, Theme.bodyFont.pixelSize * 2)
    readonly property real gap: 6
    /* The middle of the cell, in the parent's coordinates. */
    property real targetX: 0
    readonly property CalloutBubble bubble: CalloutBubble { arrowX: menu.targetX - menu.x }

    function openAt(item: Item, cell: rect) {
        parent = item;
        targetX = cell.x + cell.width / 2;
        x = targetX - width / 2;
        y = cell.y - gap - height;
        open();
    }

    margins: 8
    modal: true
    dim: false
    focus: true
    implicitWidth: Math.max(96, command.implicitWidth)
    implicitHeight: rowHeight + bubble.arrowHeight
    bottomPadding: bubble.arrowHeight
    onOpened: currentIndex = 0

    contentItem: ListView {
        interactive: false
        model: menu.contentModel
        currentIndex: menu.currentIndex
    }

    background: bubble

    T.MenuItem {
        id: command

        text: FavoritesStrings.deleteCommand
        implicitWidth: label.implicitWidth + 40
        implicitHeight: menu.rowHeight
        hoverEnabled: true
        onTriggered: menu.deleteRequested()

        Accessible.role: Accessible.MenuItem
        Accessible.name: text
        Accessible.onPressAction: command.triggered()

        Text {
            id: label

            anchors.centerIn: parent
            text: command.text
            textFormat: Text.PlainText
            font: Theme.bodyFont
            color: Theme.systemRed
        }

        background: Item {
            Rectangle {
                anchors.fill: parent
                anchors.margins: 3
                radius: 7
                color: Theme.fill
                visible: command.highlighted || command.hovered || command.down
            }
        }
    }
}
