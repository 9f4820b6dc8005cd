#include "host/fvcolor.h"

#include "host/colorbridge.h"

#include <algorithm>
#include <array>
#include <cmath>

using favrin::platform::Color;
using favrin::platform::ColorSpace;
namespace colorspacename = favrin::platform::colorspacename;

namespace {

QString text(std::string_view name)
{
    return QString::fromUtf8(name.data(), static_cast<qsizetype>(name.size()));
}

} // namespace

QString FVColor::sRGBName()
{
    return text(colorspacename::sRGB);
}

QString FVColor::displayP3Name()
{
    return text(colorspacename::displayP3);
}

FVColor::FVColor(double red, double green, double blue, double alpha, const QString &colorSpace)
{
    const auto space = ColorSpace::named(colorSpace.toStdString());
    const bool finite = std::isfinite(red) && std::isfinite(green) && std::isfinite(blue) && std::isfinite(alpha);
    if (!finite || !space || space->componentCount() != 3)
        return;
    m_valid = true;
    m_red = red;
    m_green = green;
    m_blue = blue;
    m_alpha = alpha;
    m_colorSpace = colorSpace;
}

FVColor FVColor::fromQColor(const QColor &color, const QColorSpace &space)
{
    if (!color.isValid() || !space.isValid())
        return {};
    const bool extended = color.spec() == QColor::ExtendedRgb;
    const QColor rgb = extended ? color : color.toRgb();
    auto platformSpace = favrin::host::toPlatformColorSpace(space);
    if (!platformSpace) {
        // A space that only Qt can read, e.g. from a display profile: Qt converts, with its own precision.
        const auto mapped = space.transformationToColorSpace(QColorSpace(QColorSpace::SRgb)).map(rgb);
        return fromQColor(mapped);
    }
    if (!extended && platformSpace == ColorSpace::extendedSRGB())
        platformSpace = ColorSpace::sRGB();
    const std::array<double, 3> components = {rgb.redF(), rgb.greenF(), rgb.blueF()};
    return favrin::host::toPublicColor(Color(platformSpace, components, rgb.alphaF()));
}

QColor FVColor::toQColor() const
{
    const auto color = favrin::host::toPlatformColor(*this);
    const auto transform = favrin::platform::ColorTransform::into(colorspacename::sRGB);
    if (!color || !transform)
        return {};
    const auto components = transform->convert(*color, favrin::platform::RenderingIntent::Perceptual);
    if (!components)
        return {};
    const auto [red, green, blue] = *components;
    return QColor::fromRgbF(static_cast<float>(red), static_cast<float>(green), static_cast<float>(blue),
                            static_cast<float>(std::clamp(m_alpha, 0.0, 1.0)));
}
