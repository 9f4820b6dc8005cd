#pragma once

#include "model/somecolor.h"

#include <QPointF>
#include <QSizeF>

#include <optional>

namespace favrin::spectrum {

/** The width and height of the lens, in points. */
inline constexpr double lensExtent = 33.0;

/** A finger, or what stands for it, on the spectrum. */
struct SpectrumDrag
{
    /** Where it is, or was last; none before the first drag. May lie outside the spectrum. */
    std::optional<QPointF> location;
    bool isDragging = false;
};

/** The color that a touch at @p location picks: it keeps the space and the opacity of @p current. */
model::SomeColor pickedColor(QPointF location, QSizeF size, const model::SomeColor &current);

/**
 * Where the lens belongs that marks @p color in a spectrum of @p size: under the finger while one drags, otherwise
 * where the color lies; for white and black, which lie on a whole edge, at the height of the last drag. None for a
 * color that does not lie in the field. The place may lie outside the spectrum.
 */
std::optional<QPointF> lensPlace(const model::SomeColor &color, QSizeF size, const SpectrumDrag &drag);

/** @p place moved to the nearest point of the spectrum. */
QPointF clampedIntoSpectrum(QPointF place, QSizeF size);
/** The top left corner of the lens whose place is @p place; it may reach beyond the spectrum by half its size. */
QPointF lensPosition(QPointF place, QSizeF size);

/**
 * Where keys and assistive technologies start from to change @p color: where the last pick was made, if that is where
 * the color comes from; else where the lens is; else where a color of the same hue and lightness lies.
 */
QPointF startingPlace(const model::SomeColor &color, QSizeF size, const SpectrumDrag &drag);

} // namespace favrin::spectrum
