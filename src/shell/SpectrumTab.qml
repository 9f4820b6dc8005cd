import QtQuick
import Favrin.Spectrum
import Favrin.Theme

/* The spectrum and its focus ring, in a file of its own because it is loaded when its tab is first shown. */
Spectrum {
    id: spectrum

    Accessible.role: Accessible.ColorChooser

    FocusRing {
        parentRadius: spectrum.cornerRadius
        visible: spectrum.focusVisible
    }
}
