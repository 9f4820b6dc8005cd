#include "model/oklab.h"

#include <cmath>
#include <numbers>

namespace favrin::model {

double Oklab::chroma() const
{
    return std::hypot(a, b);
}

double Oklab::hue() const
{
    const double degrees = std::atan2(b, a) * 180.0 / std::numbers::pi;
    return degrees < 0.0 ? degrees + 360.0 : degrees;
}

// The two matrices are those published by Björn Ottosson, "A perceptual color space for image processing" (2020).
Oklab oklabFromLinearSRGB(const platform::Triple &linear)
{
    const auto [r, g, b] = linear;
    const double l = std::cbrt(0.4122214708 * r + 0.5363325363 * g + 0.0514459929 * b);
    const double m = std::cbrt(0.2119034982 * r + 0.6806995451 * g + 0.1073969566 * b);
    const double s = std::cbrt(0.0883024619 * r + 0.2817188376 * g + 0.6299787005 * b);
    return {0.2104542553 * l + 0.7936177850 * m - 0.0040720468 * s,
            1.9779984951 * l - 2.4285922050 * m + 0.4505937099 * s,
            0.0259040371 * l + 0.7827717662 * m - 0.8086757660 * s};
}

} // namespace favrin::model
