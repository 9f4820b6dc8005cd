#include "service/displaycolor.h"

namespace favrin::service {

using model::SomeColor;

namespace {

// Written so that what is not a number becomes 0 too.
float displayed(double component)
{
    if (!(component > 0.0))
        return 0.0F;
    return component < 1.0 ? static_cast<float>(component) : 1.0F;
}

} // namespace

DisplayColor &DisplayColor::instance()
{
    static DisplayColor converter;
    return converter;
}

void DisplayColor::setSurfaceColorSpace(SomeColor::ColorSpace space)
{
    if (space == m_surfaceColorSpace)
        return;
    m_surfaceColorSpace = space;
    Q_EMIT surfaceColorSpaceChanged();
}

QColor DisplayColor::color(const SomeColor &color) const
{
    const SomeColor onSurface = color.converted(m_surfaceColorSpace);
    return QColor::fromRgbF(displayed(onSurface.r), displayed(onSurface.g), displayed(onSurface.b),
                            displayed(onSurface.a));
}

QColor DisplayColor::interfaceColor(const QColor &sRGB) const
{
    return color(SomeColor(sRGB.redF(), sRGB.greenF(), sRGB.blueF(), sRGB.alphaF(), SomeColor::ColorSpace::sRGB));
}

} // namespace favrin::service
