import QtQuick
import Favrin.Service

/*
 * The view of one tab. It is made when it is to be seen first, since nobody should wait for it at the start; then kept,
 * so that a drag which another tab cuts off is ended by the item that began it.
 */
Loader {
    id: loader

    required property ColorPickerState colorPickerState
    /* The tab's name in the state. */
    required property string tab
    required property string file

    function load() {
        if (visible && status === Loader.Null)
            setSource(file, { "colorPickerState": colorPickerState });
    }

    visible: colorPickerState.selectedTab === tab
    onVisibleChanged: load()
    Component.onCompleted: load()
}
