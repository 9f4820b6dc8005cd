#pragma once

#include "platform/color/color.h"

#include <string>

namespace favrin::model {

/**
 * The localized name of a color with its lightness, such as "dark green", "vivid orange" or "light bluish gray", as
 * people name colors. The color is judged as it is seen, from its own space: a Display P3 color is not brought into
 * sRGB. Opacity is no part of the name; a color that cannot be read (no space, or not finite) is black. Any thread.
 */
std::string colorDescription(const platform::Color &color);

} // namespace favrin::model
