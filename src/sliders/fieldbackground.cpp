#include "sliders/fieldbackground.h"

#include "platform/shapes/continuousroundedrect.h"

#include <QPainter>

namespace favrin::sliders {

FieldBackground::FieldBackground(QQuickItem *parent) : CrispPaintedItem(parent) {}

void FieldBackground::setColor(const QColor &color)
{
    if (color == m_color)
        return;
    m_color = color;
    repaint();
    Q_EMIT colorChanged();
}

double FieldBackground::cornerRadius() const
{
    return 8.0;
}

void FieldBackground::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    painter.fillPath(platform::continuousRoundedRect(QRectF(QPointF(), size), cornerRadius() * devicePixelRatio),
                     m_color);
}

} // namespace favrin::sliders
