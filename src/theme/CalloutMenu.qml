import QtQuick
import QtQuick.Templates as T
import Favrin.Theme

/* One command, above what it is for. It lies in the scene: a window of its own would be dismissed at once. */
T.Menu {
    id: menu

    /* Says what the command is, and hears of it. */
    required property CalloutLoader loader

    readonly property real rowHeight: Math.max(40, Theme.bodyFont.pixelSize * 2)
    readonly property real gap: 6
    /* The middle of what the command is for, in the parent's coordinates. */
    property real targetX: 0
    readonly property CalloutBubble bubble: CalloutBubble { arrowX: menu.targetX - menu.x }

    function openAt(target: Item, cell: rect) {
        parent = target;
        targetX = cell.x + cell.width / 2;
        x = targetX - width / 2;
        y = cell.y - gap - height;
        open();
    }

    margins: 8
    modal: true
    dim: false
    focus: true
    implicitWidth: Math.max(96, item.implicitWidth)
    implicitHeight: rowHeight + bubble.arrowHeight
    bottomPadding: bubble.arrowHeight
    onOpened: currentIndex = 0
    onClosed: loader.closed()

    Connections {
        target: menu.loader

        function onOpenRequested(target: Item, cell: rect) {
            menu.openAt(target, cell);
        }
    }

    contentItem: ListView {
        interactive: false
        model: menu.contentModel
        currentIndex: menu.currentIndex
    }

    background: bubble

    T.MenuItem {
        id: item

        text: menu.loader.command
        implicitWidth: label.implicitWidth + 40
        implicitHeight: menu.rowHeight
        hoverEnabled: true
        onTriggered: menu.loader.triggered()

        Accessible.role: Accessible.MenuItem
        Accessible.name: text
        Accessible.onPressAction: item.triggered()

        Text {
            id: label

            anchors.centerIn: parent
            text: item.text
            textFormat: Text.PlainText
            font: Theme.bodyFont
            color: menu.loader.isDestructive ? Theme.systemRed : Theme.label
        }

        background: Item {
            Rectangle {
                anchors.fill: parent
                anchors.margins: 3
                radius: 7
                color: Theme.fill
                visible: item.highlighted || item.hovered || item.down
            }
        }
    }
}
