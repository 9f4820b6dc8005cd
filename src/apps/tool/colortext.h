#pragma once

#include "model/somecolor.h"

#include <optional>
#include <string>
#include <string_view>

/** Colors as machines read them, the same in every locale. "No color" is "none", or null in JSON. */
namespace favrin::tool {

using Choice = std::optional<model::SomeColor>;

/** "#rrggbb" in sRGB: clipped to it, rounded, without the opacity. */
std::string hexText(const Choice &color);
/** "#rrggbbaa", likewise. */
std::string hexWithOpacityText(const Choice &color);
/** "color(srgb r g b)", "color(display-p3 r g b / a)": the color's own space and every bit of its numbers. */
std::string cssText(const Choice &color);
/** An object with "space", "components", "alpha" and "hex", and "name" when @p name has one. */
std::string jsonText(const Choice &color, std::string_view name);
/** One line for a pick: {"color": as jsonText(), "volatile": true or false}. */
std::string pickText(const Choice &color, std::string_view name, bool isVolatile);

/** The shortest decimal text that reads back as the same number. */
std::string numberText(double number);
/** The space's name in CSS. */
std::string_view spaceText(model::SomeColor::ColorSpace space);

} // namespace favrin::tool
