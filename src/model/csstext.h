#pragma once

#include "model/somecolor.h"

#include <string>

namespace favrin::model {

/**
 * The color as CSS: "#RRGGBB" or "#RRGGBBAA" for sRGB, rounded to steps of 1/255, and "color(display-p3 r g b / a)"
 * with five decimals at most for Display P3. Components are clipped to 0…1, what is not a number is 0. Any thread.
 */
std::string cssText(const SomeColor &color);

} // namespace favrin::model
