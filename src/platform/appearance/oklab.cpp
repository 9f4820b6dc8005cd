#include "platform/appearance/oklab.h"

#include "platform/color/primaries.h"

#include <algorithm>
#include <cmath>

namespace favrin::platform {

namespace {

// The two matrices that define OKLab for linear sRGB. Their inverses are computed, not the published rounded ones: a
// color must come back to where it was, however near to the edge of the gamut.
constexpr Matrix conesOfLinear = {{{0.4122214708, 0.5363325363, 0.0514459929},
                                   {0.2119034982, 0.6806995451, 0.1073969566},
                                   {0.0883024619, 0.2817188376, 0.6299787005}}};
constexpr Matrix labOfCones = {{{0.2104542553, 0.7936177850, -0.0040720468},
                                {1.9779984951, -2.4285922050, 0.4505937099},
                                {0.0259040371, 0.7827717662, -0.8086757660}}};
constexpr Matrix linearOfCones = inverse(conesOfLinear);
constexpr Matrix conesOfLab = inverse(labOfCones);

/** The colors of one lightness and hue, by chroma. */
class Ray
{
public:
    Ray(double lightness, double hue)
        : m_neutral(multiplied(conesOfLab, Triple{lightness, 0.0, 0.0}))
        , m_direction(multiplied(conesOfLab, Triple{0.0, std::cos(hue), std::sin(hue)}))
    {
    }

    Triple linearAt(double chroma) const
    {
        Triple cones = {};
        for (std::size_t index = 0; index < cones.size(); ++index) {
            const double root = m_neutral[index] + chroma * m_direction[index];
            cones[index] = root * root * root;
        }
        return multiplied(linearOfCones, cones);
    }

private:
    Triple m_neutral;
    Triple m_direction;
};

} // namespace

OkLch oklchOf(const Triple &linear)
{
    auto cones = multiplied(conesOfLinear, linear);
    for (double &cone : cones)
        cone = std::cbrt(cone);
    const auto [lightness, greenRed, blueYellow] = multiplied(labOfCones, cones);
    return {lightness, std::hypot(greenRed, blueYellow), std::atan2(blueYellow, greenRed)};
}

Triple linearOf(const OkLch &color)
{
    return Ray(color.lightness, color.hue).linearAt(color.chroma);
}

double largestChroma(double lightness, double hue)
{
    // On the way to pure blue the gamut has a dent, which must not count as its edge: red falls below zero by less than
    // this and comes back. Its depth grows with the light, as everything linear does.
    const double dent = std::min(7.5e-4, 8.2e-3 * lightness * lightness * lightness);
    constexpr double rounding = 1e-9;
    const Ray ray(lightness, hue);
    const auto isInGamut = [&](double chroma) {
        const Triple linear = ray.linearAt(chroma);
        return std::all_of(linear.begin(), linear.end(),
                           [dent](double value) { return value >= -dent - rounding && value <= 1.0 + rounding; });
    };
    double inside = 0.0;
    double outside = 0.5;
    for (int step = 0; step < 20; ++step) {
        const double middle = 0.5 * (inside + outside);
        (isInGamut(middle) ? inside : outside) = middle;
    }
    return inside;
}

} // namespace favrin::platform
