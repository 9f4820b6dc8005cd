#include "model/hexcolor.h"

#include <array>
#include <cmath>
#include <cstdio>

namespace favrin::model {

namespace {

constexpr HexColorError invalidHexValue = {"com.quenta.diagnostics.invalidHexValue", -1};

/** The nearest integer of a component on the scale to 255, halves away from zero, in single precision. */
long rounded(double component)
{
    constexpr float beyondAnyColor = 1e9F;
    const auto scaled = static_cast<float>(component * 255.0);
    return std::abs(scaled) < beyondAnyColor ? std::lround(scaled) : 0;
}

bool isBlank(char16_t unit)
{
    return unit == u' ' || unit == u'\t' || unit == u'\n' || unit == u'\r';
}

std::optional<unsigned> hexDigit(char16_t unit)
{
    if (unit >= u'0' && unit <= u'9')
        return unit - u'0';
    const auto lower = static_cast<char16_t>(unit | 0x20U);
    if (lower >= u'a' && lower <= u'f')
        return lower - u'a' + 10U;
    return std::nullopt;
}

/** The number of the leading hexadecimal digits, blanks before them skipped; none without a digit. */
std::optional<unsigned> scannedHexNumber(std::u16string_view piece)
{
    while (!piece.empty() && isBlank(piece.front()))
        piece.remove_prefix(1);
    std::optional<unsigned> number;
    for (const char16_t unit : piece) {
        const auto digit = hexDigit(unit);
        if (!digit)
            break;
        number = number.value_or(0) * 16U + *digit;
    }
    return number;
}

std::optional<std::array<double, 3>> scannedComponents(std::u16string_view digits)
{
    const std::size_t count = digits.size();
    if (count != 3 && count != 6)
        return std::nullopt;
    std::array<double, 3> components = {};
    for (std::size_t i = 0; i < components.size(); ++i) {
        const std::array pair = {digits[i * count / 3], digits[(i + 1) * count / 3 - 1]};
        const auto number = scannedHexNumber({pair.data(), pair.size()});
        if (!number)
            return std::nullopt;
        components[i] = *number / 255.0;
    }
    return components;
}

} // namespace

std::string hexString(const SomeColor &color)
{
    std::string text;
    for (const double component : {color.r, color.g, color.b}) {
        std::array<char, 24> digits = {};
        std::snprintf(digits.data(), digits.size(), "%02lX", static_cast<unsigned long>(rounded(component)));
        text += digits.data();
    }
    return text;
}

std::optional<SomeColor> hexValuedColor(std::u16string_view text, std::string_view colorSpaceName, HexColorError *error)
{
    if (text.size() >= 2 && text.front() == u'#')
        text.remove_prefix(1);
    const auto components = scannedComponents(text);
    if (!components) {
        if (error)
            *error = invalidHexValue;
        return std::nullopt;
    }
    const auto [red, green, blue] = *components;
    return SomeColor(red, green, blue, 1.0,
                     colorSpaceFromPlatformName(colorSpaceName).value_or(SomeColor::ColorSpace::sRGB));
}

} // namespace favrin::model
