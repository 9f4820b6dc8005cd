#pragma once

#include <array>
#include <optional>
#include <string>
#include <string_view>

namespace favrin::service {

/** The three ways of picking a color, in the order of the tab picker. */
enum class Tab { grid, spectrum, sliders };

inline constexpr std::array<Tab, 3> allTabs = {Tab::grid, Tab::spectrum, Tab::sliders};

/** "Grid", "Spectrum" or "Sliders": what is stored, and the key of the title. */
std::string_view rawValue(Tab tab);
/** Exact and case-sensitive; none for any other text. */
std::optional<Tab> tabFromRawValue(std::string_view rawValue);
/** The title in the user's language. */
std::string localizedTitle(Tab tab);

} // namespace favrin::service
