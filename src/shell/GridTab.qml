import QtQuick
import Favrin.Grid
import Favrin.Theme

/* The grid and its focus ring. */
ColorSwatchPickerView {
    id: grid

    Accessible.role: Accessible.List

    FocusRing {
        parentRadius: grid.cornerRadius
        visible: grid.focusVisible
    }
}
