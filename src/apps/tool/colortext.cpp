#include "apps/tool/colortext.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace favrin::tool {

using model::SomeColor;
using nlohmann::ordered_json;

namespace {

constexpr std::string_view noColor = "none";

void appendByte(std::string &text, double component)
{
    constexpr std::string_view digits = "0123456789abcdef";
    const auto byte = static_cast<unsigned>(std::lround(std::clamp(component, 0.0, 1.0) * 255.0));
    text += digits[byte / 16];
    text += digits[byte % 16];
}

ordered_json json(const Choice &color, std::string_view name)
{
    if (!color)
        return nullptr;
    ordered_json object = {{"space", spaceText(color->colorSpace)},
                           {"components", {color->r, color->g, color->b}},
                           {"alpha", color->a},
                           {"hex", hexText(color)}};
    if (!name.empty())
        object["name"] = name;
    return object;
}

/** A name may hold anything that was typed; what is not UTF-8 is replaced. */
std::string dump(const ordered_json &value)
{
    return value.dump(-1, ' ', false, ordered_json::error_handler_t::replace);
}

} // namespace

std::string hexText(const Choice &color)
{
    if (!color)
        return std::string(noColor);
    const SomeColor inSRGB = color->inSRGB();
    std::string text = "#";
    for (const double component : {inSRGB.r, inSRGB.g, inSRGB.b})
        appendByte(text, component);
    return text;
}

std::string hexWithOpacityText(const Choice &color)
{
    std::string text = hexText(color);
    if (color)
        appendByte(text, color->a);
    return text;
}

std::string cssText(const Choice &color)
{
    if (!color)
        return std::string(noColor);
    std::string text = "color(" + std::string(spaceText(color->colorSpace));
    for (const double component : {color->r, color->g, color->b})
        text += ' ' + numberText(component);
    if (color->a != 1.0)
        text += " / " + numberText(color->a);
    return text + ')';
}

std::string jsonText(const Choice &color, std::string_view name)
{
    return dump(json(color, name));
}

std::string pickText(const Choice &color, std::string_view name, bool isVolatile)
{
    return dump(ordered_json{{"color", json(color, name)}, {"volatile", isVolatile}});
}

std::string numberText(double number)
{
    std::array<char, 32> buffer = {};
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), number);
    return {buffer.data(), result.ptr};
}

std::string_view spaceText(SomeColor::ColorSpace space)
{
    return space == SomeColor::ColorSpace::displayP3 ? "display-p3" : "srgb";
}

} // namespace favrin::tool
