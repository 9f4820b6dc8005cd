// What fingers, the mouse and the keyboard do to a slider.

#include "sliders/cpslider.h"

#include "sliders/sliderkeys.h"
#include "sliders/sliderrules.h"
#include "theme/theme.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QTouchEvent>

namespace favrin::sliders {

using theme::Theme;

void CPSlider::mousePressEvent(QMouseEvent *event)
{
    if (!m_pointer)
        beginDrag({Pointer::Device::Mouse}, event->position());
}

void CPSlider::mouseMoveEvent(QMouseEvent *event)
{
    if (m_pointer == Pointer{Pointer::Device::Mouse})
        drag(event->position());
}

void CPSlider::mouseReleaseEvent(QMouseEvent *)
{
    mouseUngrabEvent();
}

void CPSlider::mouseUngrabEvent()
{
    if (m_pointer == Pointer{Pointer::Device::Mouse})
        endDrag();
}

void CPSlider::touchEvent(QTouchEvent *event)
{
    if (event->type() == QEvent::TouchCancel) {
        touchUngrabEvent();
        return;
    }
    for (const QEventPoint &point : event->points())
        handleTouchPoint(point);
    event->accept();
}

void CPSlider::handleTouchPoint(const QEventPoint &point)
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

void CPSlider::touchUngrabEvent()
{
    if (m_pointer && m_pointer->device == Pointer::Device::Touch)
        endDrag();
}

void CPSlider::beginDrag(Pointer pointer, QPointF location)
{
    m_pointer = pointer;
    // A scroll view around the slider must not take the drag over.
    setKeepMouseGrab(true);
    setKeepTouchGrab(true);
    forceActiveFocus(Qt::MouseFocusReason);
    drag(location);
}

void CPSlider::drag(QPointF location)
{
    setValue(valueAt(location.x(), size(), Theme::instance().layoutDirection()));
    // After the value: the first value of a drag is still a final one.
    if (m_state)
        m_state->isVolatile.set(true);
}

void CPSlider::endDrag()
{
    m_pointer.reset();
    setKeepMouseGrab(false);
    setKeepTouchGrab(false);
    if (m_state)
        m_state->isVolatile.set(false);
}

void CPSlider::keyPressEvent(QKeyEvent *event)
{
    const auto key = valueForKey(event->key(), event->modifiers(), value(), shownSteps(sliders::component(m_component)),
                                 Theme::instance().layoutDirection());
    if (!key) {
        event->ignore();
        return;
    }
    setFocusVisible(true);
    if (*key != value())
        setValue(*key);
}

void CPSlider::focusInEvent(QFocusEvent *event)
{
    const auto reason = event->reason();
    if (reason != Qt::ActiveWindowFocusReason)
        setFocusVisible(reason == Qt::TabFocusReason || reason == Qt::BacktabFocusReason ||
                        reason == Qt::ShortcutFocusReason);
}

void CPSlider::focusOutEvent(QFocusEvent *event)
{
    if (event->reason() != Qt::ActiveWindowFocusReason)
        setFocusVisible(false);
}

void CPSlider::setFocusVisible(bool visible)
{
    if (visible == m_focusVisible)
        return;
    m_focusVisible = visible;
    Q_EMIT focusVisibleChanged();
}

} // namespace favrin::sliders
