#include "remote/sanitized.h"

#include "remote/limits.h"
#include "remote/wirecolor.h"
#include "remote/wiretext.h"

#include <algorithm>

namespace favrin::remote {

namespace {

/** The enums of the records are numbered from 0 without a gap. */
template<class Enum>
Enum knownOr(Enum value, Enum last, Enum otherwise)
{
    return value <= last ? value : otherwise;
}

double saneLength(double points)
{
    // Written so that a NaN fails the comparison.
    return points > 0.0 ? std::min(points, limits::largestSize) : 0.0;
}

std::string textOrNothing(std::string text)
{
    return isWireText(text, limits::textBytes) ? std::move(text) : std::string();
}

void cutSuggestions(std::vector<platform::Color> &colors)
{
    std::erase_if(colors, [](const platform::Color &color) { return !isFinite(color); });
    if (colors.size() > limits::suggestedColors)
        colors.erase(colors.begin() + static_cast<std::ptrdiff_t>(limits::suggestedColors), colors.end());
}

} // namespace

Traits sanitized(Traits traits)
{
    const Traits usual;
    traits.presentationContext =
        knownOr(traits.presentationContext, PresentationContext::Popover, usual.presentationContext);
    traits.appearance = knownOr(traits.appearance, Appearance::Dark, usual.appearance);
    traits.layoutDirection = knownOr(traits.layoutDirection, LayoutDirection::RightToLeft, usual.layoutDirection);
    traits.textSizeCategory =
        knownOr(traits.textSizeCategory, TextSizeCategory::AccessibilityExtraExtraExtraLarge, usual.textSizeCategory);
    traits.displayGamut = knownOr(traits.displayGamut, DisplayGamut::P3, usual.displayGamut);
    traits.displayIdentifier = textOrNothing(std::move(traits.displayIdentifier));
    traits.locale = textOrNothing(std::move(traits.locale));
    return traits;
}

Configuration sanitized(Configuration configuration)
{
    if (configuration.title)
        configuration.title = sendableText(*configuration.title, limits::titleBytes);
    if (configuration.suggestedColors)
        cutSuggestions(*configuration.suggestedColors);
    configuration.hostWindowWidth = saneLength(configuration.hostWindowWidth);
    configuration.hostWindowHeight = saneLength(configuration.hostWindowHeight);
    configuration.keyboardSpace = saneLength(configuration.keyboardSpace);
    return configuration;
}

} // namespace favrin::remote
