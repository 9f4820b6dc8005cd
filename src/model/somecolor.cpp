#include "model/somecolor.h"

#include "platform/color/displaygamut.h"
#include "platform/color/rgbconversion.h"
#include "platform/strings/localizedstring.h"

#include <cmath>

namespace favrin::model {

namespace {

constexpr double tolerance = 0.001;

platform::ColorSpace platformColorSpace(SomeColor::ColorSpace space)
{
    return space == SomeColor::ColorSpace::displayP3 ? platform::ColorSpace::displayP3() : platform::ColorSpace::sRGB();
}

// The display is asked only when the color's own space does not decide.
SomeColor::ColorSpace spaceOrDeviceDefault(const platform::Color &platformColor)
{
    if (platformColor.colorSpace()) {
        if (const auto own = colorSpaceFromPlatformColorSpace(*platformColor.colorSpace()))
            return *own;
    }
    return deviceDefaultColorSpace();
}

} // namespace

SomeColor::SomeColor(double red, double green, double blue, double alpha, ColorSpace space)
    : r(red), g(green), b(blue), a(alpha), colorSpace(space)
{
}

SomeColor::SomeColor(const platform::Color &platformColor)
    : SomeColor(platformColor, spaceOrDeviceDefault(platformColor))
{
}

SomeColor::SomeColor(const platform::Color &platformColor, ColorSpace space)
    : a(platformColor.alpha()), colorSpace(space)
{
    const auto transform = platform::ColorTransform::into(platformName(space));
    const auto converted = transform->convert(platformColor, platform::RenderingIntent::Perceptual);
    if (!converted)
        return;
    r = (*converted)[0];
    g = (*converted)[1];
    b = (*converted)[2];
}

platform::Color SomeColor::platformColor() const
{
    return platform::Color(platformColorSpace(colorSpace), platform::Triple{r, g, b}, a);
}

SomeColor SomeColor::converted(ColorSpace target) const
{
    if (colorSpace == target)
        return *this;
    // The same result as by way of the platform color and its transform, without making either.
    const platform::Triple encoded = {r, g, b};
    const platform::Triple result = target == ColorSpace::sRGB ? platform::convertedDisplayP3ToSRGB(encoded)
                                                               : platform::convertedSRGBToDisplayP3(encoded);
    if (!std::isfinite(r + g + b) || !std::isfinite(result[0] + result[1] + result[2]))
        return SomeColor(0.0, 0.0, 0.0, a, target);
    return SomeColor(result[0], result[1], result[2], a, target);
}

double SomeColor::operator[](Component component) const
{
    switch (component) {
    case Component::r:
        return r;
    case Component::g:
        return g;
    case Component::b:
        return b;
    case Component::a:
        break;
    }
    return a;
}

SomeColor SomeColor::setting(Component component, double value) const
{
    SomeColor copy = *this;
    switch (component) {
    case Component::r:
        copy.r = value;
        break;
    case Component::g:
        copy.g = value;
        break;
    case Component::b:
        copy.b = value;
        break;
    case Component::a:
        copy.a = value;
        break;
    }
    return copy;
}

bool SomeColor::isApproximatelyEqual(const SomeColor &other, bool includingAlpha) const
{
    const auto isNear = [](double left, double right) { return std::abs(left - right) < tolerance; };
    if (colorSpace != other.colorSpace || !isNear(r, other.r) || !isNear(g, other.g) || !isNear(b, other.b))
        return false;
    return !includingAlpha || isNear(a, other.a);
}

std::string displayName(SomeColor::ColorSpace space)
{
    if (space == SomeColor::ColorSpace::displayP3)
        return platform::localizedString("Display P3", "Name for the display P3 color space.");
    return platform::localizedString("sRGB", "Name of the sRGB color space.");
}

std::string_view platformName(SomeColor::ColorSpace space)
{
    return space == SomeColor::ColorSpace::displayP3 ? platform::colorspacename::displayP3
                                                     : platform::colorspacename::sRGB;
}

std::optional<SomeColor::ColorSpace> colorSpaceFromPlatformName(std::string_view name)
{
    for (const SomeColor::ColorSpace space : allColorSpaces) {
        if (platformName(space) == name)
            return space;
    }
    return std::nullopt;
}

std::optional<SomeColor::ColorSpace> colorSpaceFromPlatformColorSpace(const platform::ColorSpace &platformColorSpace)
{
    const std::optional<std::string> name = platformColorSpace.name();
    return name ? colorSpaceFromPlatformName(*name) : std::nullopt;
}

SomeColor::ColorSpace deviceDefaultColorSpace()
{
    static const auto space = platform::displayGamut() == platform::DisplayGamut::SRGB
                                  ? SomeColor::ColorSpace::sRGB
                                  : SomeColor::ColorSpace::displayP3;
    return space;
}

std::optional<SomeColor::Component> componentFromRawValue(int rawValue)
{
    if (rawValue < 0 || rawValue > 3)
        return std::nullopt;
    return static_cast<SomeColor::Component>(rawValue);
}

} // namespace favrin::model

std::size_t std::hash<favrin::model::SomeColor>::operator()(const favrin::model::SomeColor &color) const noexcept
{
    std::size_t seed = 0;
    const auto feed = [&seed](std::size_t value) { seed ^= value + 0x9e3779b97f4a7c15U + (seed << 6) + (seed >> 2); };
    for (const double component : {color.r, color.g, color.b, color.a})
        feed(std::hash<double>{}(component));
    feed(static_cast<std::size_t>(color.colorSpace));
    return seed;
}
