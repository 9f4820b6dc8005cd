#include "spectrum/spectrumrules.h"

#include "spectrum/spectrummapping.h"
#include "spectrum/spectrumrenderer.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace favrin::spectrum {

using model::SomeColor;

namespace {

SomeColor platformGray(double white)
{
    return SomeColor(platform::Color(platform::ColorSpace::gray(), std::span(&white, 1), 1.0));
}

const SomeColor &referenceWhite()
{
    static const SomeColor color = platformGray(1.0);
    return color;
}

const SomeColor &referenceBlack()
{
    static const SomeColor color = platformGray(0.0);
    return color;
}

// Written so that what is not a number becomes 0 too.
double clamped(double value, double largest)
{
    return value > 0.0 ? std::min(value, largest) : 0.0;
}

} // namespace

SomeColor pickedColor(QPointF location, QSizeF size, const SomeColor &current)
{
    const SomeColor picked(colorForPoint(location, size), current.colorSpace);
    return picked.setting(SomeColor::Component::a, current.a);
}

std::optional<QPointF> lensPlace(const SomeColor &color, QSizeF size, const SpectrumDrag &drag)
{
    if (drag.location && drag.isDragging)
        return drag.location;
    if (const auto point = pointForColor(color, size))
        return point;
    const double height = drag.location ? drag.location->y() : 0.0;
    if (color.isApproximatelyEqual(referenceWhite(), false))
        return QPointF(0.0, height);
    if (color.isApproximatelyEqual(referenceBlack(), false))
        return QPointF(std::numeric_limits<double>::max(), height);
    return std::nullopt;
}

QPointF clampedIntoSpectrum(QPointF place, QSizeF size)
{
    return {clamped(place.x(), size.width()), clamped(place.y(), size.height())};
}

QPointF lensPosition(QPointF place, QSizeF size)
{
    return clampedIntoSpectrum(place, size) - QPointF(lensExtent * 0.5, lensExtent * 0.5);
}

QPointF startingPlace(const SomeColor &color, QSizeF size, const SpectrumDrag &drag)
{
    if (drag.location && pickedColor(*drag.location, size, color) == color)
        return clampedIntoSpectrum(*drag.location, size);
    if (const auto place = lensPlace(color, size, drag))
        return clampedIntoSpectrum(*place, size);
    const SomeColor sRGB = color.inSRGB();
    const QPointF location = SpectrumRenderer::positionForColor(
        {static_cast<float>(sRGB.r), static_cast<float>(sRGB.g), static_cast<float>(sRGB.b)});
    return clampedIntoSpectrum(pointForLocation(location, size), size);
}

} // namespace favrin::spectrum
