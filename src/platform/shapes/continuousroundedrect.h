#pragma once

#include <QPainterPath>
#include <QRectF>

namespace favrin::platform {

/**
 * A rectangle whose corners are smoothed in curvature: each corner leaves the straight edge gently, runs along a circle
 * of @p radius around its middle and returns gently, so that no edge of light shows where line and arc meet.
 *
 * A corner takes up 1.6 radii of each edge. Where the rectangle is too small for that the smoothing shrinks first, then
 * the radius. Same units as @p rect; runs clockwise from the top edge in a y-down system.
 */
QPainterPath continuousRoundedRect(const QRectF &rect, double radius);

} // namespace favrin::platform
