#pragma once

#include <QRect>

class QQuickItem;

namespace favrin::platform {

/** An area of an item in the coordinates of the screen; empty for an item in no window. */
QRect screenRect(const QQuickItem &item, const QRectF &area);
/** The same of the whole item. */
QRect screenRect(const QQuickItem &item);

} // namespace favrin::platform
