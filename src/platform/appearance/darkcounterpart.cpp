#include "platform/appearance/darkcounterpart.h"

#include "platform/appearance/oklab.h"
#include "platform/color/rgbconversion.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <numbers>

namespace favrin::platform {

namespace {

struct Knot
{
    double light;
    double dark;
};

// Lightness in the light and in the dark appearance. Deep colors rise above a dark background (lightness about 0.23),
// the middle stays, pale tints come down a little so that their hue shows; black and white are what they are.
constexpr Knot knots[] = {{0.0, 0.0},   {0.17, 0.31}, {0.30, 0.40}, {0.45, 0.52},
                          {0.70, 0.71}, {0.85, 0.84}, {0.95, 0.93}, {1.0, 1.0}};

double darkLightness(double lightness)
{
    const auto *upper = std::find_if(std::next(std::begin(knots)), std::prev(std::end(knots)),
                                     [lightness](const Knot &knot) { return lightness <= knot.light; });
    const auto &lower = *std::prev(upper);
    const double part = (lightness - lower.light) / (upper->light - lower.light);
    return lower.dark + std::clamp(part, 0.0, 1.0) * (upper->dark - lower.dark);
}

// How far the chroma of a color may grow with what the gamut offers; more would turn pale yellow into bright yellow.
constexpr double largestGrowth = 1.3;

/**
 * The chroma that the gamut offers at a lightness, averaged over some degrees of hue: beside pure blue the edge of the
 * gamut drops so steeply that colors which look alike would be treated differently.
 */
double offeredChroma(double lightness, double hue)
{
    constexpr int reach = 4;
    constexpr double degree = std::numbers::pi / 180.0;
    double sum = 0.0;
    double weights = 0.0;
    for (int offset = -reach; offset <= reach; ++offset) {
        const double weight = reach + 1 - std::abs(offset);
        sum += weight * largestChroma(lightness, hue + offset * degree);
        weights += weight;
    }
    return sum / weights;
}

/** The chroma follows what the gamut offers at either lightness, so that vivid colors stay vivid and inside. */
OkLch darkCounterpart(const OkLch &light)
{
    const double lightness = darkLightness(light.lightness);
    const double before = offeredChroma(light.lightness, light.hue);
    const double after = offeredChroma(lightness, light.hue);
    const double growth = before > 0.0 ? std::min(after / before, largestGrowth) : 1.0;
    return {lightness, std::min(light.chroma * growth, largestChroma(lightness, light.hue)), light.hue};
}

double darkGray(double encoded)
{
    const double lightness = darkLightness(std::cbrt(decodedSRGB(encoded)));
    return encodedSRGB(lightness * lightness * lightness);
}

Triple darkCounterpart(const Triple &encoded)
{
    const auto &[red, green, blue] = encoded;
    // On the way through OKLab rounding would tint grays and white in their last digits.
    if (red == green && green == blue) {
        const double gray = darkGray(red);
        return {gray, gray, gray};
    }
    auto result = linearOf(darkCounterpart(oklchOf({decodedSRGB(red), decodedSRGB(green), decodedSRGB(blue)})));
    std::transform(result.begin(), result.end(), result.begin(), encodedSRGB);
    return result;
}

} // namespace

Color convertColor(const Color &color, Appearance source, Appearance target)
{
    if (source != Appearance::Light || target != Appearance::Dark)
        return color;
    const auto encoded = ColorTransform::into(colorspacename::sRGB)->convert(color, RenderingIntent::Default);
    return encoded ? Color(ColorSpace::sRGB(), darkCounterpart(*encoded), color.alpha()) : color;
}

} // namespace favrin::platform
