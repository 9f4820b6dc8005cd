#include "platform/shapes/continuousroundedrect.h"

#include <QTransform>

#include <algorithm>
#include <cmath>
#include <numbers>

namespace favrin::platform {
namespace {

constexpr double preferredSmoothing = 0.6;

/**
 * One corner at the origin, coming along the top edge from the left and leaving down the right edge: two easing curves
 * with the rest of the quarter circle between them. The curvature of an easing curve grows from 0 to that of the
 * circle.
 */
struct Corner
{
    double extent;
    double arcSpan;
    double arcChord;
    double inset;
    double drop;
    double near;
    double far;

    Corner(double radius, double smoothing)
        : extent((1.0 + smoothing) * radius)
        , arcSpan(std::numbers::pi / 2.0 * (1.0 - smoothing))
        , arcChord(std::numbers::sqrt2 * radius * std::sin(arcSpan / 2.0))
    {
        // The tangent where curve meets circle has turned by `turn`; drop and inset follow from the circle there.
        const double turn = (std::numbers::pi / 2.0 - arcSpan) / 2.0;
        const double reach = radius * std::tan(turn / 2.0);
        inset = reach * std::cos(turn);
        drop = reach * std::sin(turn);
        near = (extent - arcChord - inset - drop) / 3.0;
        far = 2.0 * near;
    }
};

void addCorner(QPainterPath &path, const Corner &corner, double radius, const QTransform &place)
{
    const auto at = [&](double x, double y) { return place.map(QPointF(x, y)); };
    const QPointF arcStart(-corner.extent + corner.far + corner.near + corner.inset, corner.drop);
    const QPointF arcEnd(arcStart.x() + corner.arcChord, arcStart.y() + corner.arcChord);

    path.lineTo(at(-corner.extent, 0.0));
    path.cubicTo(at(-corner.extent + corner.far, 0.0), at(-corner.extent + corner.far + corner.near, 0.0),
                 place.map(arcStart));
    const double turn = (std::numbers::pi / 2.0 - corner.arcSpan) / 2.0;
    const double handle = 4.0 / 3.0 * std::tan(corner.arcSpan / 4.0) * radius;
    const QPointF along(std::cos(turn) * handle, std::sin(turn) * handle);
    path.cubicTo(place.map(arcStart + along), place.map(arcEnd - QPointF(along.y(), along.x())), place.map(arcEnd));
    path.cubicTo(at(0.0, corner.extent - corner.far - corner.near), at(0.0, corner.extent - corner.far),
                 at(0.0, corner.extent));
}

} // namespace

QPainterPath continuousRoundedRect(const QRectF &rect, double radius)
{
    const double room = std::min(rect.width(), rect.height()) / 2.0;
    const double usedRadius = std::min(radius, room);
    QPainterPath path;
    if (!(usedRadius > 0.0)) {
        path.addRect(rect);
        return path;
    }
    const Corner corner(usedRadius, std::clamp(room / usedRadius - 1.0, 0.0, preferredSmoothing));

    path.moveTo(rect.left() + corner.extent, rect.top());
    const QPointF corners[] = {rect.topRight(), rect.bottomRight(), rect.bottomLeft(), rect.topLeft()};
    double angle = 0.0;
    for (const QPointF &point : corners) {
        addCorner(path, corner, usedRadius, QTransform::fromTranslate(point.x(), point.y()).rotate(angle));
        angle += 90.0;
    }
    path.closeSubpath();
    return path;
}

} // namespace favrin::platform
