#include "model/colordescription.h"

#include "model/coloranchors.h"

#include <cmath>
#include <string_view>

namespace favrin::model {

namespace {

// Up to here no tint is seen.
constexpr double neutralChroma = 0.012;
constexpr double blackLightness = 0.20;
constexpr double whiteLightness = 0.965;

Oklab oklabOf(const platform::Color &color)
{
    constexpr Oklab black = {0.0, 0.0, 0.0};
    if (!color.colorSpace())
        return black;
    const auto components = color.components();
    const bool isGray = components.size() == 1;
    const Oklab oklab = oklabFromLinearSRGB(
        color.colorSpace()->toLinearSRGB({components[0], isGray ? 0.0 : components[1], isGray ? 0.0 : components[2]}));
    return std::isfinite(oklab.lightness) && std::isfinite(oklab.chroma()) ? oklab : black;
}

ColorTerm neutralTerm(double lightness)
{
    if (lightness < blackLightness)
        return ColorTerm::Black;
    return lightness < whiteLightness ? ColorTerm::Gray : ColorTerm::White;
}

ColorTerm tintedGray(double hue)
{
    if (hue < 25.0 || hue >= 340.0)
        return ColorTerm::PinkishGray;
    if (hue < 80.0)
        return ColorTerm::BrownishGray;
    if (hue < 115.0)
        return ColorTerm::YellowishGray;
    if (hue < 190.0)
        return ColorTerm::GreenishGray;
    return hue < 285.0 ? ColorTerm::BluishGray : ColorTerm::PurplishGray;
}

ColorTerm termOf(const Oklab &color)
{
    if (color.chroma() < neutralChroma)
        return neutralTerm(color.lightness);
    const ColorTerm nearest = nearestColorTerm(color);
    if (nearest != ColorTerm::Gray)
        return nearest;
    return color.lightness < whiteLightness ? tintedGray(color.hue()) : ColorTerm::White;
}

std::string filledIn(std::string format, const std::string &name)
{
    constexpr std::string_view placeholder = "%@";
    if (const std::size_t place = format.find(placeholder); place != std::string::npos)
        format.replace(place, placeholder.size(), name);
    return format;
}

} // namespace

std::string colorDescription(const platform::Color &color)
{
    const Oklab oklab = oklabOf(color);
    const ColorTerm term = termOf(oklab);
    if (term == ColorTerm::Black || term == ColorTerm::White)
        return localizedName(term);
    return filledIn(localizedFormat(lightnessTerm(term, oklab.lightness, oklab.chroma())), localizedName(term));
}

} // namespace favrin::model
