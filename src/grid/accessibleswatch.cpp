#include "grid/accessibleswatch.h"

#include "grid/colorswatchpickerview.h"
#include "platform/queue/queue.h"

#include <QQuickWindow>

namespace favrin::grid {

AccessibleSwatch::AccessibleSwatch(ColorSwatchPickerView &view, CellPosition cell)
    : m_view(&view)
    , m_cell(cell)
    , m_description(platform::backgroundQueue(), platform::mainQueue(), [this] { announceName(); })
{
}

bool AccessibleSwatch::isValid() const
{
    return !m_view.isNull();
}

QWindow *AccessibleSwatch::window() const
{
    return m_view ? m_view->window() : nullptr;
}

QAccessibleInterface *AccessibleSwatch::parent() const
{
    return QAccessible::queryAccessibleInterface(m_view);
}

QString AccessibleSwatch::text(QAccessible::Text kind) const
{
    if (kind != QAccessible::Name || !m_view)
        return {};
    return QString::fromStdString(m_description.evaluate(m_view->color(m_cell)));
}

QRect AccessibleSwatch::rect() const
{
    return m_view ? screenRect(*m_view, m_view->cellRect(m_cell)) : QRect();
}

QAccessible::State AccessibleSwatch::state() const
{
    QAccessible::State state;
    if (!m_view) {
        state.invalid = true;
        return state;
    }
    state.selectable = true;
    state.selected = m_view->isSelected(m_cell);
    state.focusable = true;
    state.focused = m_view->hasActiveFocus() && m_view->markedCell() == m_cell;
    state.invisible = !m_view->isVisible();
    return state;
}

void *AccessibleSwatch::interface_cast(QAccessible::InterfaceType type)
{
    return type == QAccessible::ActionInterface ? static_cast<QAccessibleActionInterface *>(this) : nullptr;
}

QStringList AccessibleSwatch::actionNames() const
{
    return {pressAction()};
}

void AccessibleSwatch::doAction(const QString &actionName)
{
    if (actionName == pressAction() && m_view && m_view->isEnabled())
        m_view->pick(m_cell);
}

void AccessibleSwatch::announceName()
{
    QAccessibleEvent event(this, QAccessible::NameChanged);
    QAccessible::updateAccessibility(&event);
}

QRect screenRect(const QQuickItem &item, const QRectF &area)
{
    if (!item.window())
        return {};
    const QRectF inWindow = item.mapRectToScene(area);
    return QRectF(item.window()->mapToGlobal(inWindow.topLeft()), inWindow.size()).toRect();
}

} // namespace favrin::grid
