#include "service/inputshield.h"

#include <QCoreApplication>
#include <QQuickWindow>

namespace favrin::service {

InputShield::InputShield(QQuickItem *parent) : QQuickItem(parent)
{
    // Above whatever its siblings choose for themselves.
    setZ(1e6);
    setVisible(false);
    setAcceptedMouseButtons(Qt::AllButtons);
    setAcceptTouchEvents(true);
    setAcceptHoverEvents(true);
}

InputShield::~InputShield() = default;

void InputShield::setRaised(bool raised)
{
    setVisible(raised);
    // On the application, because composed text goes straight to the item that has the focus.
    if (raised)
        QCoreApplication::instance()->installEventFilter(this);
    else
        QCoreApplication::instance()->removeEventFilter(this);
}

void InputShield::mousePressEvent(QMouseEvent *event)
{
    event->accept();
}

void InputShield::mouseDoubleClickEvent(QMouseEvent *event)
{
    event->accept();
}

void InputShield::wheelEvent(QWheelEvent *event)
{
    event->accept();
}

void InputShield::touchEvent(QTouchEvent *event)
{
    event->accept();
}

void InputShield::hoverEnterEvent(QHoverEvent *event)
{
    event->accept();
}

bool InputShield::belongsToWindow(const QObject *receiver) const
{
    if (!window())
        return false;
    if (receiver == window())
        return true;
    const auto *item = qobject_cast<const QQuickItem *>(receiver);
    return item && item->window() == window();
}

bool InputShield::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
    case QEvent::ShortcutOverride:
    case QEvent::InputMethod:
        return belongsToWindow(watched) || QQuickItem::eventFilter(watched, event);
    default:
        return QQuickItem::eventFilter(watched, event);
    }
}

} // namespace favrin::service
