#pragma once

#include <QList>
#include <QPoint>
#include <QRect>
#include <QSize>

namespace favrin::eyedropper {

/** Where the loupe stands towards the pixel that it samples. */
enum class LoupePlacement {
    /** Around it, for a pointer. */
    Around,
    /** Above it, where a finger does not cover the loupe. */
    Above,
};

/** Lengths of the loupe's parts, in pixels of the screen. */
struct LoupeMetrics
{
    /** @p scale is pixels a point, at least 1. */
    explicit LoupeMetrics(double scale);

    double scale;
    /** Side of one magnified pixel. */
    int cell;
    /** Magnified pixels from edge to edge; odd, so that one is in the middle. */
    static constexpr int cellsAcross = 15;
    /** Diameter of what is magnified. */
    int lens;
    /** Width of the ring in the sampled color, with its edges. */
    int ring;
    /** From the loupe to its label. */
    int gap;
    /** From the sampled pixel to the loupe that stands above it. */
    int fingerRoom;
    /** How far the shadow reaches beyond everything else. */
    int shadow;
};

/** Where the loupe and its label are on the screen, in pixels. */
struct LoupeGeometry
{
    /** The magnified pixel in the middle stands for the sampled one. */
    QRect lens;
    /** The lens with its ring. */
    QRect disc;
    QRect label;
    /** All that is painted. */
    QRect bounds;

    /** The point lies on the round disc. */
    bool discContains(QPoint point) const;
};

/**
 * The loupe for the sampled pixel @p crosshair on a display. A loupe around the pixel stays there and may be cut off by
 * the display's edge; one above it gives way at the edge, below the finger or beside it, so that it is seen whole. The
 * label is always on the display.
 */
LoupeGeometry loupeGeometry(QPoint crosshair, const QRect &display, QSize label, LoupePlacement placement,
                            const LoupeMetrics &metrics);

/** The pixel of the displays that is nearest to @p pixel. */
QPoint nearestPixel(QPoint pixel, const QList<QRect> &displays);

} // namespace favrin::eyedropper
