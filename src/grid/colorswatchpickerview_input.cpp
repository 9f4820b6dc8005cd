// What fingers, the mouse and the keyboard do to the grid.

#include "grid/colorswatchpickerview.h"

#include "grid/gridkeys.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QTouchEvent>

namespace favrin::grid {

void ColorSwatchPickerView::mousePressEvent(QMouseEvent *event)
{
    if (!m_pointer)
        beginDrag({Pointer::Device::Mouse}, event->position());
}

void ColorSwatchPickerView::mouseMoveEvent(QMouseEvent *event)
{
    if (m_pointer == Pointer{Pointer::Device::Mouse})
        drag(event->position());
}

void ColorSwatchPickerView::mouseReleaseEvent(QMouseEvent *)
{
    mouseUngrabEvent();
}

void ColorSwatchPickerView::mouseUngrabEvent()
{
    if (m_pointer == Pointer{Pointer::Device::Mouse})
        endDrag();
}

void ColorSwatchPickerView::touchEvent(QTouchEvent *event)
{
    if (event->type() == QEvent::TouchCancel) {
        touchUngrabEvent();
        return;
    }
    for (const QEventPoint &point : event->points())
        handleTouchPoint(point);
    event->accept();
}

void ColorSwatchPickerView::handleTouchPoint(const QEventPoint &point)
{
    const Pointer pointer = {Pointer::Device::Touch, point.id()};
    if (point.state() == QEventPoint::Pressed && !m_pointer)
        beginDrag(pointer, point.position());
    else if (pointer != m_pointer)
        return;
    else if (point.state() == QEventPoint::Updated)
        drag(point.position());
    else if (point.state() == QEventPoint::Released)
        endDrag();
}

void ColorSwatchPickerView::touchUngrabEvent()
{
    if (m_pointer && m_pointer->device == Pointer::Device::Touch)
        endDrag();
}

void ColorSwatchPickerView::beginDrag(Pointer pointer, QPointF location)
{
    m_pointer = pointer;
    // A scroll view around the grid must not take the drag over.
    setKeepMouseGrab(true);
    setKeepTouchGrab(true);
    forceActiveFocus(Qt::MouseFocusReason);
    drag(location);
}

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
    m_pointer.reset();
    setKeepMouseGrab(false);
    setKeepTouchGrab(false);
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
    setFocusVisible(true);
    if (cell != m_markedCell)
        pick(*cell);
}

void ColorSwatchPickerView::focusInEvent(QFocusEvent *event)
{
    const auto reason = event->reason();
    if (reason != Qt::ActiveWindowFocusReason)
        setFocusVisible(reason == Qt::TabFocusReason || reason == Qt::BacktabFocusReason ||
                        reason == Qt::ShortcutFocusReason);
}

void ColorSwatchPickerView::focusOutEvent(QFocusEvent *event)
{
    if (event->reason() != Qt::ActiveWindowFocusReason)
        setFocusVisible(false);
}

void ColorSwatchPickerView::setFocusVisible(bool visible)
{
    if (visible == m_focusVisible)
        return;
    m_focusVisible = visible;
    Q_EMIT focusVisibleChanged();
}

} // namespace favrin::grid
