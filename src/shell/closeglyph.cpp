#include "shell/closeglyph.h"

#include <QPainter>
#include <QPainterPath>

#include <algorithm>

namespace favrin::shell {
namespace {

// Parts of the disc's diameter.
constexpr double crossExtent = 0.32;
constexpr double crossWidth = 0.075;

} // namespace

CloseGlyph::CloseGlyph(QQuickItem *parent) : CrispPaintedItem(parent) {}

void CloseGlyph::setDiscColor(const QColor &color)
{
    if (color == m_discColor)
        return;
    m_discColor = color;
    repaint();
    Q_EMIT discColorChanged();
}

void CloseGlyph::setCrossColor(const QColor &color)
{
    if (color == m_crossColor)
        return;
    m_crossColor = color;
    repaint();
    Q_EMIT crossColorChanged();
}

void CloseGlyph::paint(QPainter &painter, QSize size, double)
{
    const QRectF disc(QPointF(), size);
    painter.setPen(Qt::NoPen);
    painter.setBrush(m_discColor);
    painter.drawEllipse(disc);

    const double diameter = std::min(disc.width(), disc.height());
    QRectF cross(0.0, 0.0, crossExtent * diameter, crossExtent * diameter);
    cross.moveCenter(disc.center());
    // One path: the color may be translucent, and must not show twice where the strokes cross.
    QPainterPath strokes(cross.topLeft());
    strokes.lineTo(cross.bottomRight());
    strokes.moveTo(cross.topRight());
    strokes.lineTo(cross.bottomLeft());
    painter.strokePath(strokes, QPen(m_crossColor, crossWidth * diameter, Qt::SolidLine, Qt::RoundCap));
}

} // namespace favrin::shell
