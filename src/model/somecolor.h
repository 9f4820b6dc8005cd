#pragma once

#include "platform/color/color.h"

#include <array>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace favrin::model {

/**
 * The one color value: gamma-encoded components of a named space, nominally 0…1, and opacity. A plain
 * immutable-by-habit value, usable on any thread. Construction stores what it is given, bit for bit; only conversions
 * clip.
 */
class SomeColor
{
public:
    /** The space in which r, g and b are encoded. */
    enum class ColorSpace { sRGB, displayP3 };

    /** Names one field; the raw values are 0 to 3. */
    enum class Component { r = 0, g = 1, b = 2, a = 3 };

    double r = 0.0;
    double g = 0.0;
    double b = 0.0;
    /** Opacity: 0 fully transparent, 1 fully opaque. */
    double a = 1.0;
    ColorSpace colorSpace = ColorSpace::sRGB;

    SomeColor(double r, double g, double b, double a, ColorSpace colorSpace);
    /** The platform color in its own space when that is sRGB or Display P3, otherwise in the device default space. */
    explicit SomeColor(const platform::Color &platformColor);
    /**
     * The platform color converted into @p colorSpace, clipped to 0…1, its alpha unchanged. Opaque or not, a color that
     * cannot be converted comes out black.
     */
    SomeColor(const platform::Color &platformColor, ColorSpace colorSpace);

    /** The same components and alpha in the platform space of colorSpace. */
    platform::Color platformColor() const;

    /** The same color in @p target, clipped to that space; bit for bit the same when it is in that space already. */
    SomeColor converted(ColorSpace target) const;
    SomeColor inSRGB() const { return converted(ColorSpace::sRGB); }
    SomeColor inDisplayP3() const { return converted(ColorSpace::displayP3); }

    /** The field that @p component names. */
    double operator[](Component component) const;
    /** A copy with one field replaced; nothing is clamped or converted. */
    SomeColor setting(Component component, double value) const;

    /** Exact: all four components compare equal as numbers and the space is the same. */
    bool operator==(const SomeColor &other) const = default;

    /** Same space, and every component (alpha only when asked) strictly less than 0.001 apart. */
    bool isApproximatelyEqual(const SomeColor &other, bool includingAlpha = true) const;
};

/** All spaces, in the order in which they are offered. */
inline constexpr std::array<SomeColor::ColorSpace, 2> allColorSpaces = {SomeColor::ColorSpace::sRGB,
                                                                        SomeColor::ColorSpace::displayP3};

/** The localized name of the space, "sRGB" or "Display P3". */
std::string displayName(SomeColor::ColorSpace space);
/** The platform's name of the space: what travels and what is stored. */
std::string_view platformName(SomeColor::ColorSpace space);
/** The space with exactly this platform name, or none. */
std::optional<SomeColor::ColorSpace> colorSpaceFromPlatformName(std::string_view platformName);
/** The space of a platform color space, by its name; none for a space without a name or with another. */
std::optional<SomeColor::ColorSpace> colorSpaceFromPlatformColorSpace(const platform::ColorSpace &platformColorSpace);
/** displayP3 on a wide-gamut display, otherwise sRGB; asked once per process. Thread-safe. */
SomeColor::ColorSpace deviceDefaultColorSpace();

/** The component with raw value 0 to 3; none for any other number. */
std::optional<SomeColor::Component> componentFromRawValue(int rawValue);

} // namespace favrin::model

template<>
struct std::hash<favrin::model::SomeColor>
{
    std::size_t operator()(const favrin::model::SomeColor &color) const noexcept;
};
