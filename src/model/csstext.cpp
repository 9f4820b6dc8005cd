#include "model/csstext.h"

#include "model/hexcolor.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace favrin::model {
namespace {

/** Enough for every step of 16 bits. */
constexpr int decimals = 5;

double clipped(double component)
{
    return std::isnan(component) ? 0.0 : std::clamp(component, 0.0, 1.0);
}

SomeColor clipped(const SomeColor &color)
{
    return {clipped(color.r), clipped(color.g), clipped(color.b), clipped(color.a), color.colorSpace};
}

/** Never in the user's locale, never with an exponent. */
std::string number(double value)
{
    std::array<char, 16> buffer = {};
    const auto end =
        std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, std::chars_format::fixed, decimals).ptr;
    std::string text(buffer.data(), end);
    text.erase(text.find_last_not_of('0') + 1);
    if (text.ends_with('.'))
        text.pop_back();
    return text;
}

} // namespace

std::string cssText(const SomeColor &color)
{
    const SomeColor inGamut = clipped(color);
    if (color.colorSpace == SomeColor::ColorSpace::sRGB) {
        const std::string digits = "#" + hexString(inGamut);
        // The opacity has the digits of a gray of that level.
        const SomeColor level{inGamut.a, inGamut.a, inGamut.a, 1.0, color.colorSpace};
        const std::string opacity = hexString(level).substr(0, 2);
        return opacity == "FF" ? digits : digits + opacity;
    }
    const std::string components = number(inGamut.r) + " " + number(inGamut.g) + " " + number(inGamut.b);
    const std::string opacity = number(inGamut.a);
    return "color(display-p3 " + components + (opacity == "1" ? "" : " / " + opacity) + ")";
}

} // namespace favrin::model
