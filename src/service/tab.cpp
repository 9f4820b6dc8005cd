#include "service/tab.h"

#include "platform/strings/localizedstring.h"

#include <algorithm>

namespace favrin::service {

namespace {

constexpr std::string_view titleComment = "Title of the tab.";

}

std::string_view rawValue(Tab tab)
{
    switch (tab) {
    case Tab::grid:
        return platform::localizable("Grid", titleComment);
    case Tab::spectrum:
        return platform::localizable("Spectrum", titleComment);
    case Tab::sliders:
        return platform::localizable("Sliders", titleComment);
    }
    return {};
}

std::optional<Tab> tabFromRawValue(std::string_view text)
{
    const auto found = std::ranges::find(allTabs, text, [](Tab tab) { return rawValue(tab); });
    return found == allTabs.end() ? std::nullopt : std::optional(*found);
}

std::string localizedTitle(Tab tab)
{
    return platform::localizedString(rawValue(tab), titleComment);
}

} // namespace favrin::service
