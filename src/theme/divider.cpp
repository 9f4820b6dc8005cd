#include "theme/divider.h"

#include "theme/theme.h"

#include <QPainter>

namespace favrin::theme {

Divider::Divider(QQuickItem *parent) : CrispPaintedItem(parent)
{
    setImplicitHeight(1.0);
    connect(&Theme::instance(), &Theme::colorsChanged, this, [this] { repaint(); });
}

void Divider::paint(QPainter &painter, QSize size, double)
{
    painter.fillRect(0, 0, size.width(), 1, Theme::instance().separator());
}

} // namespace favrin::theme
