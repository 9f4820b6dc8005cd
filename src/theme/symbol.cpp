#include "theme/symbol.h"

#include <QPainter>

namespace favrin::theme {

Symbol::Symbol(QQuickItem *parent) : CrispPaintedItem(parent) {}

void Symbol::setKind(Kind kind)
{
    if (kind == m_kind)
        return;
    m_kind = kind;
    repaint();
    Q_EMIT kindChanged();
}

void Symbol::setColor(const QColor &color)
{
    if (color == m_color)
        return;
    m_color = color;
    repaint();
    Q_EMIT colorChanged();
}

void Symbol::paint(QPainter &painter, QSize size, double)
{
    painter.fillPath(symbolPath(static_cast<SymbolKind>(m_kind), QRectF(QPointF(), size)), m_color);
}

} // namespace favrin::theme
