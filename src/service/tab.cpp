#include "service/tab.h"

#include "platform/strings/localizedstring.h"

#include <algorithm>

namespace favrin::service {

std::string_view rawValue(Tab tab)
{
    switch (tab) {
    case Tab::grid:
        return "Grid";
    case Tab::spectrum:
        return "Spectrum";
    case Tab::sliders:
        return "Sliders";
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
    return platform::localizedString(rawValue(tab), "Title of the tab.");
}

} // namespace favrin::service
