#pragma once

#include <QPointF>
#include <QPointer>
#include <QTimer>

#include <cstdint>
#include <map>

class QMouseEvent;
class QTouchEvent;
class QWheelEvent;

namespace favrin::host {

class RemoteViewSession;

/**
 * Passes touch, pointer and wheel on to a session. Motion is merged: while the service has not drawn since the last
 * motion it was told of, later ones wait, and only the newest is sent; nothing else ever overtakes or waits.
 */
class PointerForwarder
{
public:
    PointerForwarder();

    void setSession(RemoteViewSession *session);
    /** The service drew: it has taken in what it was told. */
    void serviceDidDraw();

    void hover(const QPointF &position);
    void leave();
    void press(const QMouseEvent &event);
    void move(const QMouseEvent &event);
    void release(const QMouseEvent &event);
    /** The press was taken away: what is pressed is released where it was last. */
    void cancelPress();
    void wheel(const QWheelEvent &event);
    void touch(const QTouchEvent &event);
    void cancelTouch();

private:
    void enter(const QPointF &position);
    void sendMotion(const QPointF &position);
    void sendTouchMotion(int id, const QPointF &position);
    void motionWasSent();
    void flushPending();

    QPointer<RemoteViewSession> m_session;
    QTimer m_patience;
    bool m_waiting = false;
    bool m_entered = false;
    bool m_hasPendingMotion = false;
    QPointF m_position;
    Qt::MouseButtons m_buttons;
    std::map<int, QPointF> m_touches;
    std::map<int, QPointF> m_pendingTouches;
};

} // namespace favrin::host
