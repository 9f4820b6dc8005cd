#include "platform/input/onepointerdrag.h"

#include <QMouseEvent>
#include <QQuickItem>
#include <QTouchEvent>

#include <utility>

namespace favrin::platform {

OnePointerDrag::OnePointerDrag(QQuickItem &item, Moved moved, Ended ended)
    : m_item(item), m_moved(std::move(moved)), m_ended(std::move(ended))
{
    item.setAcceptedMouseButtons(Qt::LeftButton);
    item.setAcceptTouchEvents(true);
}

void OnePointerDrag::mousePress(const QMouseEvent &event)
{
    if (!m_pointer)
        begin({Pointer::Device::Mouse}, event.position());
}

void OnePointerDrag::mouseMove(const QMouseEvent &event)
{
    if (m_pointer == Pointer{Pointer::Device::Mouse})
        m_moved(event.position());
}

void OnePointerDrag::mouseUngrab()
{
    if (m_pointer == Pointer{Pointer::Device::Mouse})
        end();
}

void OnePointerDrag::touch(QTouchEvent &event)
{
    if (event.type() == QEvent::TouchCancel) {
        touchUngrab();
        return;
    }
    for (const QEventPoint &point : event.points())
        handlePoint(point);
    event.accept();
}

void OnePointerDrag::touchUngrab()
{
    if (m_pointer && m_pointer->device == Pointer::Device::Touch)
        end();
}

void OnePointerDrag::handlePoint(const QEventPoint &point)
{
    const Pointer pointer = {Pointer::Device::Touch, point.id()};
    if (point.state() == QEventPoint::Pressed && !m_pointer)
        begin(pointer, point.position());
    else if (pointer != m_pointer)
        return;
    else if (point.state() == QEventPoint::Updated)
        m_moved(point.position());
    else if (point.state() == QEventPoint::Released)
        end();
}

void OnePointerDrag::begin(Pointer pointer, QPointF location)
{
    m_pointer = pointer;
    // A scroll view around the item must not take the drag over.
    m_item.setKeepMouseGrab(true);
    m_item.setKeepTouchGrab(true);
    m_item.forceActiveFocus(Qt::MouseFocusReason);
    m_moved(location);
}

void OnePointerDrag::end()
{
    m_pointer.reset();
    m_item.setKeepMouseGrab(false);
    m_item.setKeepTouchGrab(false);
    m_ended();
}

} // namespace favrin::platform
