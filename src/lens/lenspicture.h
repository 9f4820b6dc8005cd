#pragma once

#include <QColor>
#include <QImage>
#include <QRectF>

namespace favrin::lens {

/** Ring and shadow of a lens: all of it but the disc of the color. Lengths are pixels. */
struct LensFrame
{
    QSize size;
    /** The outer edge of the ring. */
    QRectF circle;
    double shadowBlurRadius = 0.0;
    QColor ring;
    QColor shadow;

    bool operator==(const LensFrame &) const = default;
};

/** A frame with its color in it. */
struct LensPicture
{
    LensFrame frame;
    /** The edge of the disc within the ring. */
    QRectF disc;
    QColor color;

    bool operator==(const LensPicture &) const = default;
};

/**
 * The picture, drawn at most once while several lenses show the same; the blurred shadow, which costs most, is kept for
 * the next color. Main thread.
 */
QImage image(const LensPicture &picture);

} // namespace favrin::lens
