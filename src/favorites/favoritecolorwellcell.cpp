#include "favorites/favoritecolorwellcell.h"

#include "model/colordescription.h"
#include "model/somecolor.h"
#include "platform/shapes/shapeview.h"
#include "service/displaycolor.h"
#include "theme/theme.h"

#include <QPainter>

namespace favrin::favorites {

using service::DisplayColor;

namespace {

/** Black on black, or white on white, can be told from the background. */
void paintEdge(QPainter &painter, const QRectF &bounds, double devicePixelRatio)
{
    painter.setPen(QPen(theme::Theme::instance().separator(), devicePixelRatio));
    painter.setBrush(Qt::NoBrush);
    const double inset = devicePixelRatio / 2.0;
    painter.drawEllipse(bounds.adjusted(inset, inset, -inset, -inset));
}

} // namespace

QPainterPath blackHalf(const QRectF &bounds)
{
    QPainterPath path(bounds.topLeft());
    path.lineTo(bounds.bottomLeft());
    path.lineTo(bounds.topRight());
    path.closeSubpath();
    return path;
}

void FavoriteColorWellCell::setColor(const platform::Color &color)
{
    if (color == m_color)
        return;
    m_color = color;
    repaint();
}

void FavoriteColorWellCell::performDelete()
{
    // A copy: the cell may be gone before the action is done.
    if (const auto action = m_onDelete)
        action();
}

QString FavoriteColorWellCell::accessibilityLabel() const
{
    return QString::fromStdString(model::colorDescription(m_color));
}

void FavoriteColorWellCell::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const DisplayColor &display = DisplayColor::instance();
    const QRect bounds(QPoint(), size);
    const QColor color = display.color(model::SomeColor(m_color));
    painter.fillRect(bounds, display.interfaceColor(Qt::white));
    platform::ShapeView{blackHalf(bounds), display.interfaceColor(Qt::black)}.draw(painter);
    painter.fillRect(bounds, color);
    platform::ShapeView{circularMask(bounds, isSelected(), devicePixelRatio)}.mask(painter, bounds);
    if (theme::Theme::instance().increaseContrast())
        paintEdge(painter, bounds, devicePixelRatio);
}

} // namespace favrin::favorites
