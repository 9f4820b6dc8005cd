#pragma once

#include "platform/color/colorspace.h"

#include <span>
#include <vector>

namespace favrin::platform {

/**
 * The platform color object: a color space (or none), that space's components, and alpha.
 *
 * An immutable value, usable on any thread. Components and alpha are kept bit for bit as given; nothing is clamped.
 * Components are encoded values of the space, nominally 0…1; alpha is opacity, 0 transparent, 1 opaque.
 */
class Color
{
public:
    /** A color of one (gray) or three components. Missing components read as 0, surplus ones are dropped. */
    Color(std::optional<ColorSpace> space, std::span<const double> components, double alpha);

    /** The platform's black: gray 0, alpha 1. */
    static Color black();

    const std::optional<ColorSpace> &colorSpace() const { return m_space; }
    /** The color components, without alpha: one for gray, otherwise three. */
    std::span<const double> components() const;
    double alpha() const { return m_alpha; }

    /** Equal space, components and alpha, compared as floating-point numbers. */
    bool operator==(const Color &other) const;

private:
    std::optional<ColorSpace> m_space;
    Triple m_components = {};
    double m_alpha = 1.0;
};

/** Rendering intents by the numbers of the 2-D graphics interface. Matrix spaces render alike with each of them. */
enum class RenderingIntent {
    Default = 0,
    AbsoluteColorimetric = 1,
    RelativeColorimetric = 2,
    Perceptual = 3,
    Saturation = 4
};

/**
 * A transform into a standard-range RGB space. Taken from a process-wide cache keyed by the target; usable on any
 * thread.
 */
class ColorTransform
{
public:
    /** The cached transform into the RGB space called @p targetName; null for a name that is no standard-range RGB
     * space. */
    static std::shared_ptr<const ColorTransform> into(std::string_view targetName);

    /**
     * The color components of @p color in the target space, clipped to 0…1.
     *
     * A color already in the same standard-range space is clipped and nothing else. A color without a space, or with a
     * component that is not finite (or becomes so on the way), has no result.
     */
    std::optional<Triple> convert(const Color &color, RenderingIntent intent) const;

private:
    explicit ColorTransform(ColorSpace::Model target);
    ColorSpace::Model m_target;
};

} // namespace favrin::platform
