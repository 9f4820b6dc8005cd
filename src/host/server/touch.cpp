#include "host/server/touch.h"

#include "host/server/connection.h"
#include "host/server/fixedpoint.h"
#include "host/server/surface.h"

#include <wayland-server-protocol.h>

namespace favrin::host::server {

const void *Touch::requests()
{
    static const struct wl_touch_interface table = {destroyRequest};
    return &table;
}

Touch::Touch(Connection &connection) : m_connection(connection) {}

void Touch::bind(wl_client *client, int version, std::uint32_t id)
{
    m_resources.add(client, wl_touch_interface, version, id, requests(), this);
}

void Touch::setSurface(Surface *surface)
{
    m_surface.reset(surface ? surface->handle() : nullptr);
    m_fingers.clear();
    m_isFrameOpen = false;
}

void Touch::down(std::uint32_t time, int finger, double x, double y)
{
    if (!m_surface.get() || m_fingers.contains(finger) || !m_connection.admitsEvent())
        return;
    m_fingers[finger] = {time, x, y, false};
    const std::uint32_t serial = m_connection.nextInputSerial();
    m_resources.forEach([&](wl_resource *touch) {
        wl_touch_send_down(touch, serial, time, m_surface.get(), finger, fixedPoint(x), fixedPoint(y));
    });
    m_isFrameOpen = true;
}

void Touch::move(std::uint32_t time, int finger, double x, double y)
{
    const auto found = m_fingers.find(finger);
    if (found == m_fingers.end())
        return;
    found->second = {time, x, y, true};
    if (m_connection.hasRoomForMotion())
        sendMotion(finger, found->second);
}

void Touch::up(std::uint32_t time, int finger)
{
    const auto found = m_fingers.find(finger);
    if (found == m_fingers.end() || !m_connection.admitsEvent())
        return;
    // Lifting has no position of its own: where the finger was last is what counts.
    if (found->second.isMotionHeld)
        sendMotion(finger, found->second);
    m_fingers.erase(found);
    const std::uint32_t serial = m_connection.nextInputSerial();
    m_resources.forEach([&](wl_resource *touch) { wl_touch_send_up(touch, serial, time, finger); });
    m_isFrameOpen = true;
}

void Touch::endFrame()
{
    if (!m_isFrameOpen || !m_connection.admitsEvent())
        return;
    m_isFrameOpen = false;
    m_resources.forEach([](wl_resource *touch) { wl_touch_send_frame(touch); });
}

void Touch::cancel()
{
    if (m_fingers.empty() || !m_connection.admitsEvent())
        return;
    m_fingers.clear();
    m_isFrameOpen = false;
    m_resources.forEach([](wl_resource *touch) { wl_touch_send_cancel(touch); });
}

void Touch::sendHeldMotion()
{
    for (auto &[id, finger] : m_fingers) {
        if (finger.isMotionHeld && m_connection.hasRoomForMotion())
            sendMotion(id, finger);
    }
}

void Touch::sendMotion(int id, Finger &finger)
{
    finger.isMotionHeld = false;
    m_resources.forEach([&](wl_resource *touch) {
        wl_touch_send_motion(touch, finger.time, id, fixedPoint(finger.x), fixedPoint(finger.y));
    });
    m_isFrameOpen = true;
}

} // namespace favrin::host::server
