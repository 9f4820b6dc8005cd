#pragma once

#include "model/somecolor.h"

#include <optional>
#include <string>
#include <string_view>

namespace favrin::model {

/** Why a text is no hex code; there is one reason. */
struct HexColorError
{
    std::string_view domain;
    int code = 0;

    bool operator==(const HexColorError &) const = default;
};

/**
 * Red, green and blue as two uppercase hexadecimal digits each, in the color's own space: six characters for components
 * in 0…1, without "#". Opacity is not written. Any thread.
 */
std::string hexString(const SomeColor &color);

/**
 * The opaque color of three or six hexadecimal digits, with or without one "#" before them. Lengths are counted in
 * UTF-16 units; each digit pair counts by its leading digits, so that "1g" is 1, but it must have one.
 * @param colorSpaceName platform name of the space of the digits; a name that is not Display P3's means sRGB
 * @param error receives the reason when there is no color; may be null
 * Any thread.
 */
std::optional<SomeColor> hexValuedColor(std::u16string_view text, std::string_view colorSpaceName,
                                        HexColorError *error = nullptr);

} // namespace favrin::model
