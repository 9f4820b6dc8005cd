#pragma once

#include <cstddef>

/** What one picker may send to its host and the other way round. Both ends check against these numbers. */
namespace favrin::remote::limits {

/** libwayland ends a connection over a message of more than 4,096 bytes; what is below leaves room for its header. */
inline constexpr std::size_t titleBytes = 1024;
inline constexpr std::size_t textBytes = 256;
inline constexpr std::size_t colorsPerEvent = 96;
inline constexpr std::size_t suggestedColors = 2048;

/** Points. */
inline constexpr double largestSize = 16384.0;
/** Points; a surface beyond this is neither asked for nor shown. */
inline constexpr int largestSurface = 4096;
inline constexpr int largestScale = 4;

} // namespace favrin::remote::limits
