#include "grid/roundedrectshape.h"

namespace favrin::grid {

QPainterPath RoundedRectShape::path(const QRectF &rect) const
{
    const auto radius = [this](RectCorner corner) {
        return maskedCorners.testFlag(corner) ? maskedRadius : defaultRadius;
    };
    const double topLeft = 2.0 * radius(RectCorner::topLeft);
    const double topRight = 2.0 * radius(RectCorner::topRight);
    const double bottomRight = 2.0 * radius(RectCorner::bottomRight);
    const double bottomLeft = 2.0 * radius(RectCorner::bottomLeft);

    // arcTo() takes the square around the whole circle and draws the edge up to the arc by itself.
    QPainterPath path(QPointF(rect.left() + topLeft / 2.0, rect.top()));
    path.arcTo(rect.right() - topRight, rect.top(), topRight, topRight, 90.0, -90.0);
    path.arcTo(rect.right() - bottomRight, rect.bottom() - bottomRight, bottomRight, bottomRight, 0.0, -90.0);
    path.arcTo(rect.left(), rect.bottom() - bottomLeft, bottomLeft, bottomLeft, 270.0, -90.0);
    path.arcTo(rect.left(), rect.top(), topLeft, topLeft, 180.0, -90.0);
    path.closeSubpath();
    return path;
}

} // namespace favrin::grid
