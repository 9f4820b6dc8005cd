#include "platform/accessibility/accessibleitem.h"

#include "platform/accessibility/screenrect.h"

#include <QQuickItem>
#include <QQuickWindow>

namespace favrin::platform {

AccessibleItem::AccessibleItem(QQuickItem *item) : QAccessibleObject(item) {}

QWindow *AccessibleItem::window() const
{
    return item()->window();
}

QAccessibleInterface *AccessibleItem::parent() const
{
    for (QQuickItem *around = item()->parentItem(); around; around = around->parentItem()) {
        if (QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(around))
            return interface;
    }
    return QAccessible::queryAccessibleInterface(window());
}

QRect AccessibleItem::rect() const
{
    return screenRect(*item());
}

QAccessible::State AccessibleItem::state() const
{
    QAccessible::State state;
    state.focusable = true;
    state.focused = item()->hasActiveFocus();
    state.invisible = !item()->isVisible();
    state.disabled = !item()->isEnabled();
    return state;
}

QQuickItem *AccessibleItem::item() const
{
    return static_cast<QQuickItem *>(object());
}

} // namespace favrin::platform
