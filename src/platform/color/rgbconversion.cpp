#include "platform/color/rgbconversion.h"

#include "platform/color/powertable.h"
#include "platform/color/primaries.h"

#include <cmath>

namespace favrin::platform {

namespace {

constexpr Primaries sRGBPrimaries = {{0.64, 0.33}, {0.30, 0.60}, {0.15, 0.06}};
constexpr Primaries displayP3Primaries = {{0.680, 0.320}, {0.265, 0.690}, {0.150, 0.060}};
constexpr Chromaticity d65 = {0.3127, 0.3290};

constexpr Matrix displayP3ToSRGB =
    multiplied(inverse(matrixToXYZ(sRGBPrimaries, d65)), matrixToXYZ(displayP3Primaries, d65));
constexpr Matrix sRGBToDisplayP3 = inverse(displayP3ToSRGB);

// The curves where they are not straight, which is from 0.09 and from 0.003 on.
constexpr PowerTable<12, 5, -4> decodingPower;
constexpr PowerTable<5, 12, -9> encodingPower;

// Both spaces have the same white, so each row sums to one. Written with differences, a row leaves a neutral color
// alone exactly, whatever the last bits of its entries.
Triple multipliedKeepingNeutrals(const Matrix &matrix, const Triple &value)
{
    const auto [r, g, b] = value;
    return {r + matrix[0][1] * (g - r) + matrix[0][2] * (b - r), g + matrix[1][0] * (r - g) + matrix[1][2] * (b - g),
            b + matrix[2][0] * (r - b) + matrix[2][1] * (g - b)};
}

Triple decoded(const Triple &encoded)
{
    return {decodedSRGB(encoded[0]), decodedSRGB(encoded[1]), decodedSRGB(encoded[2])};
}

Triple encoded(const Triple &linear)
{
    return {encodedSRGB(linear[0]), encodedSRGB(linear[1]), encodedSRGB(linear[2])};
}

} // namespace

double decodedSRGB(double encoded)
{
    if (encoded <= 0.04045)
        return encoded / 12.92;
    const double base = (encoded + 0.055) / 1.055;
    return base <= 1.0 ? decodingPower(base) : std::pow(base, 2.4);
}

double decodedExtendedSRGB(double encoded)
{
    return std::copysign(decodedSRGB(std::abs(encoded)), encoded);
}

double encodedSRGB(double linear)
{
    if (linear <= 0.0)
        return 0.0;
    if (linear <= 0.0031308)
        return 12.92 * linear;
    if (linear < 1.0)
        return 1.055 * encodingPower(linear) - 0.055;
    // 1.055 - 0.055 is one bit short of 1: what is clipped to full comes out full.
    return linear >= 1.0 ? 1.0 : linear;
}

Triple linearDisplayP3ToLinearSRGB(const Triple &linear)
{
    return multipliedKeepingNeutrals(displayP3ToSRGB, linear);
}

Triple linearSRGBToLinearDisplayP3(const Triple &linear)
{
    return multipliedKeepingNeutrals(sRGBToDisplayP3, linear);
}

Triple convertedDisplayP3ToSRGB(const Triple &encodedComponents)
{
    return encoded(linearDisplayP3ToLinearSRGB(decoded(encodedComponents)));
}

Triple convertedSRGBToDisplayP3(const Triple &encodedComponents)
{
    return encoded(linearSRGBToLinearDisplayP3(decoded(encodedComponents)));
}

} // namespace favrin::platform
