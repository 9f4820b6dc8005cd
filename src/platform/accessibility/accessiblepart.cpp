#include "platform/accessibility/accessiblepart.h"

#include "platform/accessibility/screenrect.h"

#include <QQuickWindow>

namespace favrin::platform {

AccessiblePart::AccessiblePart(QQuickItem &item) : m_item(&item) {}

QWindow *AccessiblePart::window() const
{
    return m_item ? m_item->window() : nullptr;
}

QAccessibleInterface *AccessiblePart::parent() const
{
    return QAccessible::queryAccessibleInterface(m_item);
}

QRect AccessiblePart::rect() const
{
    return m_item ? screenRect(*m_item, area()) : QRect();
}

QAccessible::State AccessiblePart::state() const
{
    QAccessible::State state;
    state.invalid = m_item.isNull();
    state.invisible = !m_item || !m_item->isVisible();
    state.disabled = !m_item || !m_item->isEnabled();
    return state;
}

void *AccessiblePart::interface_cast(QAccessible::InterfaceType type)
{
    return type == QAccessible::ActionInterface ? static_cast<QAccessibleActionInterface *>(this) : nullptr;
}

QRectF AccessiblePart::area() const
{
    return m_item->boundingRect();
}

} // namespace favrin::platform
