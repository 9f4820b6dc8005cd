// What fingers, the mouse and the keyboard do to the spectrum.

#include "spectrum/spectrum.h"

#include "spectrum/spectrumkeys.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QTouchEvent>

namespace favrin::spectrum {

void Spectrum::mousePressEvent(QMouseEvent *event)
{
    if (!m_pointer)
        beginPointerDrag({Pointer::Device::Mouse}, event->position());
}

void Spectrum::mouseMoveEvent(QMouseEvent *event)
{
    if (m_pointer == Pointer{Pointer::Device::Mouse})
        drag(event->position());
}

void Spectrum::mouseReleaseEvent(QMouseEvent *)
{
    mouseUngrabEvent();
}

void Spectrum::mouseUngrabEvent()
{
    if (m_pointer == Pointer{Pointer::Device::Mouse})
        endPointerDrag();
}

void Spectrum::touchEvent(QTouchEvent *event)
{
    if (event->type() == QEvent::TouchCancel) {
        touchUngrabEvent();
        return;
    }
    for (const QEventPoint &point : event->points())
        handleTouchPoint(point);
    event->accept();
}

void Spectrum::handleTouchPoint(const QEventPoint &point)
{
    const Pointer pointer = {Pointer::Device::Touch, point.id()};
    if (point.state() == QEventPoint::Pressed && !m_pointer)
        beginPointerDrag(pointer, point.position());
    else if (pointer != m_pointer)
        return;
    else if (point.state() == QEventPoint::Updated)
        drag(point.position());
    else if (point.state() == QEventPoint::Released)
        endPointerDrag();
}

void Spectrum::touchUngrabEvent()
{
    if (m_pointer && m_pointer->device == Pointer::Device::Touch)
        endPointerDrag();
}

void Spectrum::beginPointerDrag(Pointer pointer, QPointF location)
{
    // A finger takes over from held keys; their release ends nothing any more.
    m_heldKeys.clear();
    m_pointer = pointer;
    // A scroll view around the spectrum must not take the drag over.
    setKeepMouseGrab(true);
    setKeepTouchGrab(true);
    forceActiveFocus(Qt::MouseFocusReason);
    drag(location);
}

void Spectrum::endPointerDrag()
{
    m_pointer.reset();
    setKeepMouseGrab(false);
    setKeepTouchGrab(false);
    endDrag();
}

void Spectrum::keyPressEvent(QKeyEvent *event)
{
    const auto point =
        size().isEmpty() ? std::nullopt : pointForKey(event->key(), event->modifiers(), pickPlace(), size());
    if (!point) {
        event->ignore();
        return;
    }
    setFocusVisible(true);
    if (m_pointer)
        return;
    // A held key repeats: its picks are a drag that ends when the key lifts.
    m_heldKeys.insert(event->key());
    drag(*point);
}

void Spectrum::keyReleaseEvent(QKeyEvent *event)
{
    if (event->isAutoRepeat())
        return;
    if (!m_heldKeys.remove(event->key())) {
        event->ignore();
        return;
    }
    if (m_heldKeys.isEmpty())
        endDrag();
}

void Spectrum::focusInEvent(QFocusEvent *event)
{
    const auto reason = event->reason();
    if (reason != Qt::ActiveWindowFocusReason)
        setFocusVisible(reason == Qt::TabFocusReason || reason == Qt::BacktabFocusReason ||
                        reason == Qt::ShortcutFocusReason);
}

void Spectrum::focusOutEvent(QFocusEvent *event)
{
    // The release of a held key will go elsewhere.
    if (!m_heldKeys.isEmpty()) {
        m_heldKeys.clear();
        endDrag();
    }
    if (event->reason() != Qt::ActiveWindowFocusReason)
        setFocusVisible(false);
}

void Spectrum::setFocusVisible(bool visible)
{
    if (visible == m_focusVisible)
        return;
    m_focusVisible = visible;
    Q_EMIT focusVisibleChanged();
}

} // namespace favrin::spectrum
