#include "apps/gallery/posterpaths.h"

namespace favrin::gallery {

namespace {

constexpr double horizon = 548.0;

QPainterPath hillsPath()
{
    // A little under the water, so that no paper shows where they meet.
    constexpr double foot = horizon + 4.0;
    QPainterPath path(QPointF(0.0, foot));
    path.lineTo(0.0, 432.0);
    path.cubicTo(70.0, 388.0, 128.0, 402.0, 186.0, 456.0);
    path.cubicTo(232.0, 498.0, 268.0, 506.0, 316.0, 490.0);
    path.cubicTo(382.0, 468.0, 420.0, 500.0, 470.0, 512.0);
    path.cubicTo(520.0, 524.0, 552.0, 476.0, sheetSize.width(), 462.0);
    path.lineTo(sheetSize.width(), foot);
    path.closeSubpath();
    return path;
}

QPainterPath sunPath()
{
    constexpr QPointF center(392.0, 336.0);
    constexpr double radius = 158.0;
    QPainterPath path;
    path.addEllipse(center, radius, radius);

    // Slits that widen towards the horizon.
    QPainterPath slits;
    double top = center.y() + 30.0;
    for (double height : {5.0, 8.0, 11.0, 14.0, 17.0}) {
        slits.addRect(center.x() - radius, top, 2.0 * radius, height);
        top += height + 19.0 - 0.5 * height;
    }
    path -= slits;
    path -= hillsPath();

    // The reflection: bars on the water that grow shorter with the distance from the horizon.
    double y = horizon + 30.0;
    for (double halfWidth : {132.0, 96.0, 112.0, 64.0, 40.0}) {
        path.addRoundedRect(QRectF(center.x() - halfWidth, y, 2.0 * halfWidth, 9.0), 4.5, 4.5);
        y += 26.0;
    }
    return path;
}

QPainterPath waterPath()
{
    QPainterPath path;
    path.addRect(0.0, horizon, sheetSize.width(), sheetSize.height() - horizon);
    return path;
}

} // namespace

QPainterPath posterPath(Poster::Part part)
{
    switch (part) {
    case Poster::Part::Paper: {
        QPainterPath path;
        path.addRect(QRectF(QPointF(), sheetSize));
        return path;
    }
    case Poster::Part::Sun:
        return sunPath();
    case Poster::Part::Hills:
        return hillsPath();
    case Poster::Part::Water:
        return waterPath();
    case Poster::Part::Ink:
        break;
    }
    return {};
}

} // namespace favrin::gallery
