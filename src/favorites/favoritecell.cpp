#include "favorites/favoritecell.h"

#include "theme/theme.h"

namespace favrin::favorites {
namespace {

constexpr double ringWidth = 3.0;
constexpr double ringGap = 3.0;

QPainterPath oval(const QRectF &bounds)
{
    QPainterPath path;
    path.addEllipse(bounds);
    return path;
}

QRectF inset(const QRectF &rect, double distance)
{
    return rect.adjusted(distance, distance, -distance, -distance);
}

} // namespace

QPainterPath circularMask(const QRectF &bounds, bool selected, double point)
{
    QPainterPath path = oval(bounds);
    path.setFillRule(Qt::WindingFill);
    if (selected) {
        path.addPath(oval(inset(bounds, ringWidth * point)).toReversed());
        path.addPath(oval(inset(bounds, (ringWidth + ringGap) * point)));
    }
    return path;
}

FavoriteCell::FavoriteCell(QQuickItem *parent) : CrispPaintedItem(parent)
{
    connect(&theme::Theme::instance(), &theme::Theme::colorsChanged, this, [this] { repaint(); });
}

void FavoriteCell::setSelected(bool selected)
{
    if (selected == m_selected)
        return;
    m_selected = selected;
    repaint();
}

} // namespace favrin::favorites
