#include "model/csscolor.h"

#include "model/cssnames.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <numbers>
#include <span>
#include <string>
#include <vector>

namespace favrin::model {

namespace {

using ColorSpace = SomeColor::ColorSpace;

/** No form of a color is longer; longer texts are not looked at. */
constexpr std::size_t longestText = 256;
constexpr std::string_view blanks = " \t\n\r\f\v";

std::string_view trimmed(std::string_view text, std::string_view dropped)
{
    const auto first = text.find_first_not_of(dropped);
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(dropped) - first + 1);
}

std::string lowered(std::string_view text)
{
    std::string lower(text);
    std::ranges::transform(lower, lower.begin(),
                           [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; });
    return lower;
}

SomeColor fromBytes(std::uint32_t rgb, double alpha, ColorSpace space)
{
    return {(rgb >> 16U & 0xffU) / 255.0, (rgb >> 8U & 0xffU) / 255.0, (rgb & 0xffU) / 255.0, alpha, space};
}

std::optional<SomeColor> fromHexDigits(std::string_view text, ColorSpace space)
{
    if (text.starts_with('#'))
        text.remove_prefix(1);
    const bool isShort = text.size() == 3 || text.size() == 4;
    if (!isShort && text.size() != 6 && text.size() != 8)
        return std::nullopt;
    std::string digits;
    for (const char digit : text)
        digits.append(isShort ? 2 : 1, digit);
    const bool hasAlpha = digits.size() == 8;
    std::uint32_t number = 0;
    const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), number, 16);
    if (error != std::errc() || end != digits.data() + digits.size())
        return std::nullopt;
    return hasAlpha ? fromBytes(number >> 8U, (number & 0xffU) / 255.0, space) : fromBytes(number, 1.0, space);
}

std::optional<double> number(std::string_view text)
{
    if (text.starts_with('+') && !text.starts_with("+-"))
        text.remove_prefix(1);
    double value = 0.0;
    const auto [end, error] =
        std::from_chars(text.data(), text.data() + text.size(), value, std::chars_format::general);
    if (text.empty() || error != std::errc() || end != text.data() + text.size() || !std::isfinite(value))
        return std::nullopt;
    return value;
}

/** A number, or a percentage of @p whole, divided by @p whole and clipped to 0…1. */
std::optional<double> part(std::string_view text, double whole)
{
    const bool isPercentage = text.ends_with('%');
    if (isPercentage)
        text.remove_suffix(1);
    const auto value = number(text);
    if (!value)
        return std::nullopt;
    return std::clamp(*value / (isPercentage ? 100.0 : whole), 0.0, 1.0);
}

/** What stands between the separators: blanks, or a comma or slash with or without blanks. None for an empty piece. */
std::optional<std::vector<std::string_view>> arguments(std::string_view text)
{
    constexpr std::string_view separators = ",/";
    std::vector<std::string_view> pieces;
    text = trimmed(text, blanks);
    while (true) {
        const auto end = std::min(text.find_first_of(" \t\n\r\f\v,/"), text.size());
        if (end == 0)
            return std::nullopt;
        pieces.push_back(text.substr(0, end));
        if (end == text.size())
            return pieces;
        text = trimmed(text.substr(end), blanks);
        if (separators.find(text.front()) != std::string_view::npos)
            text = trimmed(text.substr(1), blanks);
    }
}

std::optional<SomeColor> fromParts(std::span<const std::string_view> pieces, double whole, ColorSpace space)
{
    if (pieces.size() != 3 && pieces.size() != 4)
        return std::nullopt;
    std::array<double, 4> values = {0.0, 0.0, 0.0, 1.0};
    for (std::size_t i = 0; i < pieces.size(); ++i) {
        const auto value = part(pieces[i], i == 3 ? 1.0 : whole);
        if (!value)
            return std::nullopt;
        values[i] = *value;
    }
    return SomeColor(values[0], values[1], values[2], values[3], space);
}

/** Where on the circle, 0 to 1; a number without a unit counts degrees. */
std::optional<double> turn(std::string_view text)
{
    struct Unit
    {
        std::string_view name;
        double perTurn;
    };
    // "grad" before "rad", which it ends with.
    constexpr std::array<Unit, 4> units = {
        {{"deg", 360.0}, {"grad", 400.0}, {"rad", 2.0 * std::numbers::pi}, {"turn", 1.0}}};
    double perTurn = 360.0;
    for (const auto &unit : units) {
        if (text.ends_with(unit.name)) {
            text.remove_suffix(unit.name.size());
            perTurn = unit.perTurn;
            break;
        }
    }
    const auto angle = number(text);
    if (!angle)
        return std::nullopt;
    const double turns = *angle / perTurn;
    return turns - std::floor(turns);
}

/** Red, green and blue of a hue on the circle, with full saturation. */
std::array<double, 3> pureColor(double turns)
{
    const auto level = [turns](double offset) {
        const double k = std::fmod(offset + turns * 12.0, 12.0);
        return 0.5 - 0.5 * std::max(-1.0, std::min({k - 3.0, 9.0 - k, 1.0}));
    };
    return {level(0.0), level(8.0), level(4.0)};
}

/** hsl(): hue, saturation, lightness; hwb(): hue, whiteness, blackness. */
std::optional<SomeColor> fromHue(std::span<const std::string_view> pieces, bool isHwb)
{
    if (pieces.size() != 3 && pieces.size() != 4)
        return std::nullopt;
    const auto hue = turn(pieces[0]);
    const auto first = part(pieces[1], 100.0);
    const auto second = part(pieces[2], 100.0);
    const auto alpha = pieces.size() == 4 ? part(pieces[3], 1.0) : 1.0;
    if (!hue || !first || !second || !alpha)
        return std::nullopt;
    std::array<double, 3> rgb = pureColor(*hue);
    for (double &component : rgb) {
        if (!isHwb)
            component = *second + *first * std::min(*second, 1.0 - *second) * (2.0 * component - 1.0);
        else if (*first + *second >= 1.0)
            component = *first / (*first + *second);
        else
            component = *first + component * (1.0 - *first - *second);
    }
    return SomeColor(rgb[0], rgb[1], rgb[2], *alpha, ColorSpace::sRGB);
}

std::optional<SomeColor> fromFunction(std::string_view text)
{
    const auto opening = text.find('(');
    if (opening == std::string_view::npos || !text.ends_with(')'))
        return std::nullopt;
    const auto name = text.substr(0, opening);
    const auto pieces = arguments(text.substr(opening + 1, text.size() - opening - 2));
    if (!pieces)
        return std::nullopt;
    if (name == "rgb" || name == "rgba")
        return fromParts(*pieces, 255.0, ColorSpace::sRGB);
    if (name == "hsl" || name == "hsla" || name == "hwb")
        return fromHue(*pieces, name == "hwb");
    const auto components = std::span(*pieces).subspan(1);
    if (name == "color" && pieces->front() == "srgb")
        return fromParts(components, 1.0, ColorSpace::sRGB);
    if (name == "color" && pieces->front() == "display-p3")
        return fromParts(components, 1.0, ColorSpace::displayP3);
    return std::nullopt;
}

} // namespace

std::optional<SomeColor> colorFromCssText(std::string_view text, ColorSpace hexSpace)
{
    text = trimmed(text, " \t\n\r\f\v\"'`;");
    if (text.empty() || text.size() > longestText)
        return std::nullopt;
    const std::string lower = lowered(text);
    if (const auto color = fromHexDigits(lower, hexSpace))
        return color;
    if (const auto rgb = colorOfCssName(lower))
        return fromBytes(*rgb, 1.0, ColorSpace::sRGB);
    return fromFunction(lower);
}

} // namespace favrin::model
