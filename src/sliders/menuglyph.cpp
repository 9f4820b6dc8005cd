#include "sliders/menuglyph.h"

#include <QPainter>

#include <algorithm>
#include <initializer_list>

namespace favrin::sliders {
namespace {

/** Of the larger side. */
constexpr double strokeWidth = 0.13;

QPainterPath polyline(std::initializer_list<QPointF> points)
{
    QPainterPath path(*points.begin());
    for (const QPointF &point : points)
        path.lineTo(point);
    return path;
}

} // namespace

MenuGlyph::MenuGlyph(QQuickItem *parent) : CrispPaintedItem(parent) {}

void MenuGlyph::setColor(const QColor &color)
{
    if (color == m_color)
        return;
    m_color = color;
    repaint();
    Q_EMIT colorChanged();
}

void MenuGlyph::paint(QPainter &painter, QSize size, double)
{
    const double width = strokeWidth * std::max(size.width(), size.height());
    const QRectF inside = QRectF(QPointF(), size).adjusted(width / 2, width / 2, -width / 2, -width / 2);
    const QTransform place = QTransform::fromTranslate(inside.x(), inside.y()).scale(inside.width(), inside.height());
    painter.strokePath(place.map(strokes()), QPen(m_color, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
}

QPainterPath MenuIndicator::strokes() const
{
    QPainterPath path = polyline({{0.0, 0.35}, {0.5, 0.0}, {1.0, 0.35}});
    path.addPath(polyline({{0.0, 0.65}, {0.5, 1.0}, {1.0, 0.65}}));
    return path;
}

QPainterPath CheckMark::strokes() const
{
    return polyline({{0.0, 0.55}, {0.35, 0.95}, {1.0, 0.05}});
}

} // namespace favrin::sliders
