#pragma once

#include "model/somecolor.h"

#include <span>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace favrin::model {

/** Why a color could not be written or read. */
enum class CodingError {
    /** The string under "rawValue" names no color space. */
    unknownRawValue,
    keyNotFound,
    typeMismatch,
    /** A component to be written is infinite or not a number. */
    nonFiniteNumber,
    /** The text is no JSON, is not UTF-8, holds a number out of range, or is nested or long beyond reason. */
    dataCorrupted
};

/**
 * The persisted form of colors: compact JSON objects with "r", "g", "b", "a" as numbers and "colorSpace" as an object
 * whose "rawValue" is the platform name of the space. A finite color comes back bit for bit. All functions are pure.
 *
 * Decoding takes any bytes. Keys are required in full, further keys are ignored, of a key given twice the last counts.
 */
std::variant<std::string, CodingError> encodedColor(const SomeColor &color);
std::variant<SomeColor, CodingError> decodedColor(std::string_view json);

/** A JSON array of colors in the given order. One color that cannot be written or read fails the whole list. */
std::variant<std::string, CodingError> encodedColors(std::span<const SomeColor> colors);
std::variant<std::vector<SomeColor>, CodingError> decodedColors(std::string_view json);

} // namespace favrin::model
