#include "grid/accessibleswatch.h"

#include "grid/colorswatchpickerview.h"
#include "platform/queue/queue.h"

namespace favrin::grid {

AccessibleSwatch::AccessibleSwatch(ColorSwatchPickerView &view, CellPosition cell)
    : AccessiblePart(view)
    , m_cell(cell)
    , m_description(platform::backgroundQueue(), platform::mainQueue(), [this] { announceName(); })
{
}

ColorSwatchPickerView *AccessibleSwatch::view() const
{
    return static_cast<ColorSwatchPickerView *>(item());
}

QString AccessibleSwatch::text(QAccessible::Text kind) const
{
    if (kind != QAccessible::Name || !view())
        return {};
    return QString::fromStdString(m_description.evaluate(view()->color(m_cell)));
}

QRectF AccessibleSwatch::area() const
{
    return view()->cellRect(m_cell);
}

QAccessible::State AccessibleSwatch::state() const
{
    QAccessible::State state = AccessiblePart::state();
    if (!view())
        return state;
    state.selectable = true;
    state.selected = view()->isSelected(m_cell);
    state.focusable = true;
    state.focused = view()->hasActiveFocus() && view()->markedCell() == m_cell;
    return state;
}

QStringList AccessibleSwatch::actionNames() const
{
    return {pressAction()};
}

void AccessibleSwatch::doAction(const QString &actionName)
{
    if (actionName == pressAction() && view() && view()->isEnabled())
        view()->pick(m_cell);
}

void AccessibleSwatch::announceName()
{
    QAccessibleEvent event(this, QAccessible::NameChanged);
    QAccessible::updateAccessibility(&event);
}

} // namespace favrin::grid
