#include "remote/wireoptions.h"

namespace favrin::remote {

namespace {

enum Option : std::uint32_t {
    ShowsAlpha = 1,
    AllowsNoColor = 2,
    ShowsEyedropper = 4,
    UsesDarkGridInDarkMode = 8,
    IsEmbedded = 16,
    HasTitle = 32,
    HasSuggestedColors = 64,
};

enum AccessibilityOption : std::uint32_t { ReduceMotion = 1, IncreaseContrast = 2 };

std::uint32_t bitIf(bool set, std::uint32_t bit)
{
    return set ? bit : 0;
}

template<class T>
void makePresent(std::optional<T> &value, bool present)
{
    if (!present)
        value.reset();
    else if (!value)
        value.emplace();
}

} // namespace

std::uint32_t optionBits(const Configuration &configuration)
{
    return bitIf(configuration.showsAlpha, ShowsAlpha) | bitIf(configuration.allowsNoColor, AllowsNoColor) |
           bitIf(configuration.showsEyedropper, ShowsEyedropper) |
           bitIf(configuration.shouldUseDarkGridInDarkMode, UsesDarkGridInDarkMode) |
           bitIf(configuration.isEmbedded, IsEmbedded) | bitIf(configuration.title.has_value(), HasTitle) |
           bitIf(configuration.suggestedColors.has_value(), HasSuggestedColors);
}

void applyOptionBits(std::uint32_t bits, Configuration &configuration)
{
    configuration.showsAlpha = bits & ShowsAlpha;
    configuration.allowsNoColor = bits & AllowsNoColor;
    configuration.showsEyedropper = bits & ShowsEyedropper;
    configuration.shouldUseDarkGridInDarkMode = bits & UsesDarkGridInDarkMode;
    configuration.isEmbedded = bits & IsEmbedded;
    makePresent(configuration.title, bits & HasTitle);
    makePresent(configuration.suggestedColors, bits & HasSuggestedColors);
}

std::uint32_t accessibilityBits(const Traits &traits)
{
    return bitIf(traits.reduceMotion, ReduceMotion) | bitIf(traits.increaseContrast, IncreaseContrast);
}

void applyAccessibilityBits(std::uint32_t bits, Traits &traits)
{
    traits.reduceMotion = bits & ReduceMotion;
    traits.increaseContrast = bits & IncreaseContrast;
}

} // namespace favrin::remote
