#pragma once

#include "platform/color/color.h"

#include <cstddef>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

/**
 * Colors on the wire: arrays of 64-bit floating-point numbers beside the platform name of their space.
 *
 * A named space keeps its components bit for bit. A color in a space without a name travels converted to linear sRGB,
 * unclipped. A color without a space travels without a name; so does, when it is read, a color whose space name this
 * end does not know: its components are kept, its meaning is not. Pure functions, any thread.
 */
namespace favrin::remote {

using platform::Color;

/** One color ready to be sent. */
struct WireColor
{
    /** Components, then alpha; empty for no color. */
    std::vector<double> numbers;
    std::optional<std::string> space;
};

/** A run of colors of one space, of at most limits::colorsPerEvent colors. */
struct WireColorRun
{
    /** Empty for colors without a space. */
    std::string space;
    std::vector<double> numbers;
};

/** None for a color with a number that is not finite: it must not be sent. */
std::optional<WireColor> encodeColor(const std::optional<Color> &color);

/** The outer value is missing when the array is malformed, the inner one when it says "no color". */
std::optional<std::optional<Color>> decodeColor(std::span<const std::byte> array,
                                                std::optional<std::string_view> space);

/** In the order given, without colors that are not finite and those past limits::suggestedColors. */
std::vector<WireColorRun> encodeColorRuns(std::span<const Color> colors);

/** The colors of one run, or none when the array is malformed or holds more than limits::colorsPerEvent. */
std::optional<std::vector<Color>> decodeColorRun(std::span<const std::byte> array, std::string_view space);

/** Exactly @p count finite numbers, or none. The array need not be aligned. */
std::optional<std::vector<double>> decodeNumbers(std::span<const std::byte> array, std::size_t count);

/** Every component and alpha is finite. */
bool isFinite(const Color &color);

} // namespace favrin::remote
