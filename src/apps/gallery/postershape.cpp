#include "apps/gallery/postershape.h"

#include "apps/gallery/posterpaths.h"

#include <QPainter>

namespace favrin::gallery {

PosterShape::PosterShape(QQuickItem *parent) : CrispPaintedItem(parent), m_path(posterPath(m_part)) {}

void PosterShape::setPart(Poster::Part part)
{
    if (part == m_part)
        return;
    m_part = part;
    m_path = posterPath(part);
    repaint();
    Q_EMIT partChanged();
}

void PosterShape::setColor(const QColor &color)
{
    if (color == m_color)
        return;
    m_color = color;
    repaint();
    Q_EMIT colorChanged();
}

bool PosterShape::contains(const QPointF &point) const
{
    if (width() <= 0.0 || height() <= 0.0)
        return false;
    return m_path.contains(QPointF(point.x() * sheetSize.width() / width(), point.y() * sheetSize.height() / height()));
}

void PosterShape::paint(QPainter &painter, QSize size, double /*devicePixelRatio*/)
{
    painter.scale(size.width() / sheetSize.width(), size.height() / sheetSize.height());
    painter.fillPath(m_path, m_color);
}

} // namespace favrin::gallery
