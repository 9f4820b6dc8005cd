#pragma once

#include "model/somecolor.h"
#include "service/colorpickerstate.h"

class QPainter;

namespace favrin::sliders {

/** The checkerboard behind a translucent color: what tells that it is translucent. */
struct OpacityBackground
{
    /** Side of one square, in points. */
    double squareSize = 0.0;
    /** Of the squares whose row and column add up to an even number; the others are white or black. */
    model::SomeColor squareColor;
    service::ColorScheme colorScheme = service::ColorScheme::Light;

    /** Squares drawn over a width or a height: one more than fit, and never less than three. */
    int squareCount(double extent) const;

    /** The color of a square, counted from the top leading corner. */
    model::SomeColor color(int row, int column) const;

    /**
     * Fills an area of @p size pixels at the painter's origin, starting at its top leading corner. Squares have their
     * edges on whole pixels.
     */
    void paint(QPainter &painter, QSize size, double devicePixelRatio, Qt::LayoutDirection direction) const;
};

} // namespace favrin::sliders
