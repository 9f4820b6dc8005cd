#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace favrin::model {

/** The sRGB color of a CSS color name in lower case, as 0xRRGGBB; none for any other text. Any thread. */
std::optional<std::uint32_t> colorOfCssName(std::string_view name);

} // namespace favrin::model
