#pragma once

#include "platform/color/color.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

/** What travels between picker service and host, as values; plain C++ for both ends. Numbers as in the protocol. */
namespace favrin::remote {

enum class PresentationContext : std::uint32_t { Unspecified = 0, Presented = 1, Embedded = 2, Popover = 3 };
enum class Appearance : std::uint32_t { Unspecified = 0, Light = 1, Dark = 2 };
enum class LayoutDirection : std::uint32_t { LeftToRight = 0, RightToLeft = 1 };
enum class TextSizeCategory : std::uint32_t {
    ExtraSmall = 0,
    Small = 1,
    Medium = 2,
    Large = 3,
    ExtraLarge = 4,
    ExtraExtraLarge = 5,
    ExtraExtraExtraLarge = 6,
    AccessibilityMedium = 7,
    AccessibilityLarge = 8,
    AccessibilityExtraLarge = 9,
    AccessibilityExtraExtraLarge = 10,
    AccessibilityExtraExtraExtraLarge = 11,
};
enum class DisplayGamut : std::uint32_t { SRGB = 0, P3 = 1 };
/** Where the keyboard focus moves: in reading order, as by the Tab key, or against it. */
enum class FocusDirection : std::uint32_t { Forward = 0, Backward = 1 };
enum class BackgroundEffect : std::uint32_t { None = 0, ThickMaterial = 1 };

/** What the service knows of its surroundings. */
struct Traits
{
    PresentationContext presentationContext = PresentationContext::Unspecified;
    Appearance appearance = Appearance::Light;
    LayoutDirection layoutDirection = LayoutDirection::LeftToRight;
    TextSizeCategory textSizeCategory = TextSizeCategory::Large;
    DisplayGamut displayGamut = DisplayGamut::SRGB;
    /** Hardware identifier of the display that shows the picker; may be empty. */
    std::string displayIdentifier = {};
    /** BCP 47; empty for the locale of the process. */
    std::string locale = {};
    bool reduceMotion = false;
    bool increaseContrast = false;

    bool operator==(const Traits &) const = default;
};

/** The configuration record `_FVColorPickerViewControllerConfiguration`. */
struct Configuration
{
    /** UTF-8; none selects the localized default. */
    std::optional<std::string> title = std::nullopt;
    bool showsAlpha = true;
    bool allowsNoColor = false;
    bool showsEyedropper = true;
    std::optional<std::vector<platform::Color>> suggestedColors = std::nullopt;
    bool shouldUseDarkGridInDarkMode = false;
    /** 0 unspecified, 1 light, 2 dark; the service leaves its grid as it is for any other number. */
    std::int32_t userInterfaceStyleForGrid = 0;
    bool isEmbedded = false;
    /** Points. */
    double hostWindowWidth = 0.0;
    double hostWindowHeight = 0.0;
    /** Points that the host's keyboard covers at the bottom of the picker. */
    double keyboardSpace = 0.0;

    bool operator==(const Configuration &) const = default;
};

} // namespace favrin::remote
