import QtQuick
import Favrin.Grid
import Favrin.Service
import Favrin.Theme

/* The area of the current tab. */
Item {
    id: content

    required property ColorPickerState colorPickerState

    readonly property real aspectRatio: 1.2
    readonly property bool showsSpectrum: colorPickerState.selectedTab === "Spectrum"

    implicitHeight: width / aspectRatio

    ColorSwatchPickerView {
        id: grid

        anchors.fill: parent
        visible: !content.showsSpectrum
        colorPickerState: content.colorPickerState
        Accessible.role: Accessible.List

        FocusRing {
            parentRadius: grid.cornerRadius
            visible: grid.focusVisible
        }
    }

    // Made when it is to be seen first, since nobody should wait for it at the start; then kept, so that a drag which
    // another tab cuts off is ended by the item that began it.
    Loader {
        id: spectrumLoader

        function load() {
            if (visible && status === Loader.Null)
                setSource("SpectrumTab.qml", { "colorPickerState": content.colorPickerState });
        }

        anchors.fill: parent
        visible: content.showsSpectrum
        onVisibleChanged: load()
        Component.onCompleted: load()
    }
}
