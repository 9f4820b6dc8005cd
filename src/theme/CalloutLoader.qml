import QtQuick
import Favrin.Theme

/* A CalloutMenu that is made when it is wanted first: menus are dear, and most users never open this one. */
Loader {
    id: loader

    /* What the command is called, and whether something is lost by it. */
    required property string command
    property bool isDestructive: false

    signal triggered
    signal closed

    function openAt(target: Item, cell: rect) {
        if (status === Loader.Null)
            setSource("CalloutMenu.qml", {
                "command": Qt.binding(() => loader.command),
                "isDestructive": Qt.binding(() => loader.isDestructive)
            });
        (item as CalloutMenu).openAt(target, cell);
    }

    Connections {
        target: loader.item as CalloutMenu

        function onTriggered() {
            loader.triggered();
        }

        function onClosed() {
            loader.closed();
        }
    }
}
