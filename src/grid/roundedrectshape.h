#pragma once

#include "grid/rectcorner.h"

#include <QPainterPath>
#include <QRectF>

namespace favrin::grid {

/** A rectangle with circular corners of two radii, in the units of the rectangle it fills. */
struct RoundedRectShape
{
    /** Of the corners that are not masked. */
    double defaultRadius = 0.0;
    /** Of the masked corners. */
    double maskedRadius = 0.0;
    RectCorners maskedCorners;

    /** The closed outline, clockwise from the top left corner's end. */
    QPainterPath path(const QRectF &rect) const;
};

} // namespace favrin::grid
