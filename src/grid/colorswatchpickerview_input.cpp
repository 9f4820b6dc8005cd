// What a drag and the keyboard do to the grid.

#include "grid/colorswatchpickerview.h"

#include "grid/gridkeys.h"

#include <QKeyEvent>

namespace favrin::grid {

void ColorSwatchPickerView::drag(QPointF location)
{
    const auto cell = cellAt(location, size());
    if (!cell || !m_state)
        return;
    // The flag first: whoever hears of the color must know that it is not final.
    m_state->isVolatile.set(true);
    pick(*cell);
}

void ColorSwatchPickerView::endDrag()
{
    if (m_state)
        m_state->isVolatile.set(false);
}

void ColorSwatchPickerView::keyPressEvent(QKeyEvent *event)
{
    const bool selected = m_state && m_state->hasSelectedColor();
    const CellPosition start = selected ? nearestCell(m_state->colorBinding(), palette()) : CellPosition();
    const auto cell = cellForKey(event->key(), event->modifiers(), m_markedCell, start);
    if (!cell) {
        event->ignore();
        return;
    }
    m_focusVisibility.keyUsed();
    if (cell != m_markedCell)
        pick(*cell);
}

} // namespace favrin::grid
