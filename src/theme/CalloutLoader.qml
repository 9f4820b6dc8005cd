import QtQuick

/* A CalloutMenu that is made when it is wanted first: menus are dear, and most users never open this one. */
Loader {
    id: loader

    /* What the command is called, and whether something is lost by it. */
    required property string command
    property bool isDestructive: false

    signal triggered
    signal closed
    /* For the menu. */
    signal openRequested(target: Item, cell: rect)

    function openAt(target: Item, cell: rect) {
        // By its file: the mere name of its type would load it, and the templates below it, with the picker.
        if (status === Loader.Null)
            setSource("CalloutMenu.qml", { "loader": loader });
        openRequested(target, cell);
    }
}
