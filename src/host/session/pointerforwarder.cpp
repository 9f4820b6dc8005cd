#include "host/session/pointerforwarder.h"

#include "host/session/remoteviewsession.h"

#include <QMouseEvent>
#include <QTouchEvent>
#include <QWheelEvent>

#include <array>
#include <chrono>
#include <utility>

#include <linux/input-event-codes.h>

namespace favrin::host {

using namespace std::chrono_literals;

namespace {

/** A service that draws nothing in answer to a motion (hovering over nothing) must still hear of the next. */
constexpr auto patience = 8ms;

/** What one click of a wheel scrolls, in points, and the angle of a click in Qt's units. */
constexpr double pointsPerClick = 15.0;
constexpr double anglePerClick = 120.0;

std::uint32_t evdevButton(Qt::MouseButton button)
{
    constexpr std::array<std::pair<Qt::MouseButton, std::uint32_t>, 5> codes = {{
        {Qt::LeftButton, BTN_LEFT},
        {Qt::RightButton, BTN_RIGHT},
        {Qt::MiddleButton, BTN_MIDDLE},
        {Qt::BackButton, BTN_SIDE},
        {Qt::ForwardButton, BTN_EXTRA},
    }};
    for (const auto &[qtButton, code] : codes) {
        if (qtButton == button)
            return code;
    }
    return 0;
}

} // namespace

PointerForwarder::PointerForwarder()
{
    m_patience.setSingleShot(true);
    m_patience.setInterval(patience);
    m_patience.setTimerType(Qt::PreciseTimer);
    QObject::connect(&m_patience, &QTimer::timeout, &m_patience, [this] { serviceDidDraw(); });
}

void PointerForwarder::setSession(RemoteViewSession *session)
{
    m_session = session;
    m_patience.stop();
    m_waiting = m_entered = m_hasPendingMotion = false;
    m_buttons = {};
    m_touches.clear();
    m_pendingTouches.clear();
}

void PointerForwarder::serviceDidDraw()
{
    m_patience.stop();
    m_waiting = false;
    flushPending();
}

void PointerForwarder::motionWasSent()
{
    m_waiting = true;
    m_patience.start();
    m_session->flush();
}

void PointerForwarder::flushPending()
{
    if (!m_session || (!m_hasPendingMotion && m_pendingTouches.empty()))
        return;
    auto &server = m_session->server();
    if (std::exchange(m_hasPendingMotion, false)) {
        server.pointerMotion(m_session->now(), m_position.x(), m_position.y());
        server.pointerFrame();
    }
    if (!m_pendingTouches.empty()) {
        for (const auto &[id, position] : std::exchange(m_pendingTouches, {}))
            server.touchMotion(m_session->now(), id, position.x(), position.y());
        server.touchFrame();
    }
    motionWasSent();
}

void PointerForwarder::enter(const QPointF &position)
{
    m_position = position;
    if (std::exchange(m_entered, true))
        return;
    m_session->server().pointerEnter(position.x(), position.y());
    m_session->server().pointerFrame();
}

void PointerForwarder::sendMotion(const QPointF &position)
{
    m_position = position;
    m_hasPendingMotion = true;
    if (!m_waiting)
        flushPending();
}

void PointerForwarder::hover(const QPointF &position)
{
    if (!m_session)
        return;
    if (m_entered) {
        sendMotion(position);
        return;
    }
    enter(position);
    m_session->flush();
}

void PointerForwarder::leave()
{
    // While a button is held the service keeps the pointer, as it would in a window of its own.
    if (!m_session || !m_entered || m_buttons)
        return;
    flushPending();
    m_entered = false;
    m_session->server().pointerLeave();
    m_session->server().pointerFrame();
    m_session->flush();
}

void PointerForwarder::press(const QMouseEvent &event)
{
    const auto code = evdevButton(event.button());
    if (!m_session || code == 0)
        return;
    flushPending();
    auto &server = m_session->server();
    const auto position = event.position();
    enter(position);
    server.pointerMotion(m_session->now(), position.x(), position.y());
    server.pointerButton(m_session->now(), code, true);
    server.pointerFrame();
    m_buttons |= event.button();
    m_session->flush();
}

void PointerForwarder::move(const QMouseEvent &event)
{
    if (m_session && m_entered)
        sendMotion(event.position());
}

void PointerForwarder::release(const QMouseEvent &event)
{
    if (!m_session || !m_buttons.testFlag(event.button()))
        return;
    // The release happens where the pointer is, so the last motion goes first.
    if (event.position() != m_position) {
        m_position = event.position();
        m_hasPendingMotion = true;
    }
    flushPending();
    m_buttons &= ~Qt::MouseButtons(event.button());
    m_session->server().pointerButton(m_session->now(), evdevButton(event.button()), false);
    m_session->server().pointerFrame();
    m_session->flush();
}

void PointerForwarder::cancelPress()
{
    if (!m_session || !m_buttons)
        return;
    flushPending();
    for (const auto button : {Qt::LeftButton, Qt::RightButton, Qt::MiddleButton, Qt::BackButton, Qt::ForwardButton}) {
        if (m_buttons.testFlag(button))
            m_session->server().pointerButton(m_session->now(), evdevButton(button), false);
    }
    m_buttons = {};
    m_session->server().pointerFrame();
    m_session->flush();
}

void PointerForwarder::wheel(const QWheelEvent &event)
{
    if (!m_session)
        return;
    flushPending();
    enter(event.position());
    const QPointF clicks = QPointF(event.angleDelta()) / anglePerClick;
    const QPointF points = event.hasPixelDelta() ? QPointF(event.pixelDelta()) : clicks * pointsPerClick;
    // Qt counts up and left as positive, the wire down and right.
    m_session->server().pointerAxis(m_session->now(), -points.x(), -points.y(), -qRound(clicks.x()),
                                    -qRound(clicks.y()));
    m_session->server().pointerFrame();
    m_session->flush();
}

void PointerForwarder::touch(const QTouchEvent &event)
{
    if (!m_session)
        return;
    if (event.type() == QEvent::TouchCancel) {
        cancelTouch();
        return;
    }
    auto &server = m_session->server();
    for (const auto &point : event.points()) {
        const auto position = point.position();
        const int id = point.id();
        switch (point.state()) {
        case QEventPoint::Pressed:
            flushPending();
            m_touches[id] = position;
            server.touchDown(m_session->now(), id, position.x(), position.y());
            server.touchFrame();
            break;
        case QEventPoint::Updated:
            if (m_touches.contains(id))
                sendTouchMotion(id, position);
            break;
        case QEventPoint::Released:
            if (!m_touches.contains(id))
                break;
            if (m_touches[id] != position)
                m_pendingTouches[id] = position;
            flushPending();
            m_touches.erase(id);
            server.touchUp(m_session->now(), id);
            server.touchFrame();
            break;
        default:
            break;
        }
    }
    m_session->flush();
}

void PointerForwarder::sendTouchMotion(int id, const QPointF &position)
{
    m_touches[id] = position;
    m_pendingTouches[id] = position;
    if (!m_waiting)
        flushPending();
}

void PointerForwarder::cancelTouch()
{
    if (!m_session || m_touches.empty())
        return;
    m_touches.clear();
    m_pendingTouches.clear();
    m_session->server().touchCancel();
    m_session->flush();
}

} // namespace favrin::host
