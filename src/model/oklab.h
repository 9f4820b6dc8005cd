#pragma once

#include "platform/color/colorspace.h"

namespace favrin::model {

/** A color in the perceptual space Oklab: lightness 0…1, and two opponent axes (green to red, blue to yellow). */
struct Oklab
{
    double lightness;
    double a;
    double b;

    /** The distance from gray; about 0.3 for the strongest colors of a display. */
    double chroma() const;
    /** Degrees, 0 up to 360, from the red end of the a axis towards yellow. */
    double hue() const;
};

/** Of linear sRGB components, which may lie outside 0…1 (colors of a wider gamut). */
Oklab oklabFromLinearSRGB(const platform::Triple &linear);

} // namespace favrin::model
