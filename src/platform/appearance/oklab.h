#pragma once

#include "platform/color/colorspace.h"

namespace favrin::platform {

/**
 * A color by perceived lightness (0 black, 1 white), chroma (0 neutral, sRGB reaches about 0.32) and hue in radians:
 * the polar form of OKLab, whose hue lines are straighter than those of CIELAB, above all in the blues.
 */
struct OkLch
{
    double lightness = 0.0;
    double chroma = 0.0;
    double hue = 0.0;
};

/** Of linear-light sRGB components. */
OkLch oklchOf(const Triple &linear);
/** Linear-light sRGB, which lies outside 0…1 for colors outside the gamut. */
Triple linearOf(const OkLch &color);

/** The largest chroma that sRGB offers at a lightness and hue. */
double largestChroma(double lightness, double hue);

} // namespace favrin::platform
