#include "platform/accessibility/screenrect.h"

#include <QQuickItem>
#include <QQuickWindow>

namespace favrin::platform {

QRect screenRect(const QQuickItem &item, const QRectF &area)
{
    if (!item.window())
        return {};
    const QRectF inWindow = item.mapRectToScene(area);
    return QRectF(item.window()->mapToGlobal(inWindow.topLeft()), inWindow.size()).toRect();
}

QRect screenRect(const QQuickItem &item)
{
    return screenRect(item, item.boundingRect());
}

} // namespace favrin::platform
