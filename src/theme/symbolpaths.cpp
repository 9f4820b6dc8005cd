#include "theme/symbolpaths.h"

#include <QPainterPathStroker>
#include <QTransform>

#include <algorithm>
#include <initializer_list>

namespace favrin::theme {
namespace {

// Widths of the pen, as parts of the larger side.
constexpr double chevronPen = 0.13;
constexpr double crossPen = 0.2;
constexpr double eyedropperPen = 0.085;

QPainterPath polyline(std::initializer_list<QPointF> points)
{
    QPainterPath path(*points.begin());
    for (const QPointF &point : points)
        path.lineTo(point);
    return path;
}

QPainterPath stroked(const QPainterPath &line, double width)
{
    QPainterPathStroker pen;
    pen.setWidth(width);
    pen.setCapStyle(Qt::RoundCap);
    pen.setJoinStyle(Qt::RoundJoin);
    return pen.createStroke(line).simplified();
}

/** A line given in a square from 0 to 1, drawn with a round pen so that its outside touches @p bounds. */
QPainterPath strokedWithin(const QRectF &bounds, const QPainterPath &line, double penPart)
{
    const double width = penPart * std::max(bounds.width(), bounds.height());
    const QRectF inside = bounds.adjusted(width / 2, width / 2, -width / 2, -width / 2);
    const QTransform place = QTransform::fromTranslate(inside.x(), inside.y()).scale(inside.width(), inside.height());
    return stroked(place.map(line), width);
}

QRectF centeredSquare(const QRectF &bounds)
{
    const double side = std::min(bounds.width(), bounds.height());
    QRectF square(0.0, 0.0, side, side);
    square.moveCenter(bounds.center());
    return square;
}

QPainterPath disc(const QRectF &bounds)
{
    QPainterPath path;
    path.addEllipse(centeredSquare(bounds));
    return path;
}

QPainterPath roundedBar(const QRectF &rect)
{
    QPainterPath path;
    path.addRoundedRect(rect, std::min(rect.width(), rect.height()) / 2, std::min(rect.width(), rect.height()) / 2);
    return path;
}

/** Upright, its tip at the bottom, around the origin and 1.34 high: a bulb, a collar and a tube of glass. */
QPainterPath uprightEyedropper()
{
    const QPainterPath tube = polyline({{-0.125, -0.1}, {-0.125, 0.4}, {0.0, 0.6}, {0.125, 0.4}, {0.125, -0.1}});
    return roundedBar({-0.15, -0.67, 0.3, 0.6})
        .united(roundedBar({-0.28, -0.23, 0.56, 0.14}))
        .united(stroked(tube, eyedropperPen));
}

QPainterPath eyedropper(const QRectF &bounds)
{
    const QPainterPath leaning = QTransform().rotate(45.0).map(uprightEyedropper());
    const QRectF extent = leaning.boundingRect();
    const QRectF square = centeredSquare(bounds);
    const double scale = square.width() / std::max(extent.width(), extent.height());
    return QTransform::fromTranslate(square.center().x(), square.center().y())
        .scale(scale, scale)
        .translate(-extent.center().x(), -extent.center().y())
        .map(leaning);
}

} // namespace

QPainterPath symbolPath(SymbolKind kind, const QRectF &bounds)
{
    switch (kind) {
    case SymbolKind::Disc:
        return disc(bounds);
    case SymbolKind::Cross: {
        QPainterPath cross = polyline({{0.0, 0.0}, {1.0, 1.0}});
        cross.addPath(polyline({{1.0, 0.0}, {0.0, 1.0}}));
        return strokedWithin(bounds, cross, crossPen);
    }
    case SymbolKind::Eyedropper:
        return eyedropper(bounds);
    case SymbolKind::CheckMark:
        return strokedWithin(bounds, polyline({{0.0, 0.55}, {0.35, 0.95}, {1.0, 0.05}}), chevronPen);
    case SymbolKind::UpDownChevrons: {
        QPainterPath chevrons = polyline({{0.0, 0.35}, {0.5, 0.0}, {1.0, 0.35}});
        chevrons.addPath(polyline({{0.0, 0.65}, {0.5, 1.0}, {1.0, 0.65}}));
        return strokedWithin(bounds, chevrons, chevronPen);
    }
    }
    return {};
}

} // namespace favrin::theme
