#pragma once

#include "model/somecolor.h"
#include "spectrum/fieldcolor.h"

#include <QPointF>
#include <QSizeF>

#include <optional>

namespace favrin::spectrum {

// Which color lies where in the field, and back. Pure functions, usable on any thread. The field is computed in strict
// single precision, points of a view in double precision.

/** How far the color at @p x is from the hue: toward white left of the middle, toward black right of it. */
float lightnessFactor(float x);
/** The hue brought to the lightness at @p x, whose lightnessFactor() is @p factor. */
FieldColor shaded(const FieldColor &hue, float x, float factor);

/** The one color of a place in the field. */
FieldColor fieldColor(FieldLocation location);
/** The place that shows a color; of a color that none shows, the place of its hue and its lightness. */
FieldLocation fieldLocation(const FieldColor &color);

/** The location of a point of a view, which may lie outside; the view's origin is its top left corner. */
QPointF locationForPoint(QPointF point, QSizeF size);
/** The point of a view that shows a location. */
QPointF pointForLocation(QPointF location, QSizeF size);
/** The color under a point of a view, or of the nearest edge: opaque, in extended sRGB. */
platform::Color colorForPoint(QPointF point, QSizeF size);
/** Where a view shows @p color; none for a color that has no single place in the field, as grays have not. */
std::optional<QPointF> pointForColor(const model::SomeColor &color, QSizeF size);

} // namespace favrin::spectrum
