#include "shell/focusreveal.h"

#include <QQuickWindow>
#include <QVariant>

#include <algorithm>

namespace favrin::shell {
namespace {

/** Kept free above and below; enough for the bar that lies over a phone's keyboard. */
constexpr double margin = 52.0;

bool needsToBeSeen(const QQuickItem &item)
{
    return item.flags().testFlag(QQuickItem::ItemAcceptsInputMethod) || item.property("focusVisible").toBool() ||
           item.property("visualFocus").toBool();
}

} // namespace

void FocusReveal::setContent(QQuickItem *content)
{
    if (content == m_content)
        return;
    m_content = content;
    Q_EMIT contentChanged();
}

double FocusReveal::position(double current, double viewHeight, double contentHeight) const
{
    const QQuickItem *item = m_content && m_content->window() ? m_content->window()->activeFocusItem() : nullptr;
    if (!item || contentHeight <= viewHeight || !m_content->isAncestorOf(item) || !needsToBeSeen(*item))
        return current;
    const QRectF place = m_content->mapRectFromItem(item, item->boundingRect());
    const double lowest = std::min(place.top() - margin, contentHeight - viewHeight);
    return std::max(0.0, std::min(std::max(current, place.bottom() + margin - viewHeight), lowest));
}

} // namespace favrin::shell
