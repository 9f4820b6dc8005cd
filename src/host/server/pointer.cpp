#include "host/server/pointer.h"

#include "host/server/connection.h"
#include "host/server/fixedpoint.h"
#include "host/server/surface.h"

#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

bool hasSince(wl_resource *resource, int version)
{
    return wl_resource_get_version(resource) >= version;
}

} // namespace

const void *Pointer::requests()
{
    static const struct wl_pointer_interface table = [] {
        struct wl_pointer_interface requests = {};
        requests.set_cursor = [](wl_client *, wl_resource *r, std::uint32_t, wl_resource *surface, std::int32_t,
                                 std::int32_t) {
            static_cast<Pointer *>(wl_resource_get_user_data(r))->setCursor(r, surface);
        };
        requests.release = destroyRequest;
        return requests;
    }();
    return &table;
}

Pointer::Pointer(Connection &connection) : m_connection(connection) {}

void Pointer::bind(wl_client *client, int version, std::uint32_t id)
{
    wl_resource *pointer = m_resources.add(client, wl_pointer_interface, version, id, requests(), this);
    if (pointer && m_surface.get() && m_position)
        sendEnter(pointer);
}

void Pointer::setSurface(Surface *surface)
{
    m_surface.reset(surface ? surface->handle() : nullptr);
    m_isMotionHeld = false;
    m_isFrameOpen = false;
    sendEnter();
}

void Pointer::enter(double x, double y)
{
    if (m_position)
        return;
    m_position = Position{0, x, y};
    sendEnter();
}

void Pointer::leave()
{
    if (!m_position)
        return;
    m_position.reset();
    m_isMotionHeld = false;
    if (!m_surface.get() || !m_connection.admitsEvent())
        return;
    const std::uint32_t serial = m_connection.nextSerial();
    m_resources.forEach([&](wl_resource *pointer) { wl_pointer_send_leave(pointer, serial, m_surface.get()); });
    m_isFrameOpen = true;
}

void Pointer::move(std::uint32_t time, double x, double y)
{
    if (!m_position)
        return;
    m_position = Position{time, x, y};
    m_isMotionHeld = true;
    sendHeldMotion();
}

void Pointer::sendHeldMotion()
{
    if (!m_isMotionHeld || !m_surface.get() || !m_connection.hasRoomForMotion())
        return;
    sendMotion();
}

void Pointer::press(std::uint32_t time, std::uint32_t button, bool pressed)
{
    if (!admitsButton())
        return;
    const std::uint32_t serial = m_connection.nextInputSerial();
    const auto state = pressed ? WL_POINTER_BUTTON_STATE_PRESSED : WL_POINTER_BUTTON_STATE_RELEASED;
    m_resources.forEach([&](wl_resource *pointer) { wl_pointer_send_button(pointer, serial, time, button, state); });
    m_isFrameOpen = true;
}

void Pointer::scroll(std::uint32_t time, double horizontal, double vertical, int horizontalDiscrete,
                     int verticalDiscrete)
{
    if (!m_position || !m_surface.get() || !m_connection.hasRoomForMotion())
        return;
    const bool isWheel = horizontalDiscrete != 0 || verticalDiscrete != 0;
    const bool isEnd = horizontal == 0.0 && vertical == 0.0 && !isWheel;
    m_resources.forEach([&](wl_resource *pointer) {
        if (hasSince(pointer, WL_POINTER_AXIS_SOURCE_SINCE_VERSION))
            wl_pointer_send_axis_source(pointer,
                                        isWheel ? WL_POINTER_AXIS_SOURCE_WHEEL : WL_POINTER_AXIS_SOURCE_FINGER);
        if (isEnd && hasSince(pointer, WL_POINTER_AXIS_STOP_SINCE_VERSION)) {
            wl_pointer_send_axis_stop(pointer, time, WL_POINTER_AXIS_HORIZONTAL_SCROLL);
            wl_pointer_send_axis_stop(pointer, time, WL_POINTER_AXIS_VERTICAL_SCROLL);
        }
        sendScroll(pointer, WL_POINTER_AXIS_HORIZONTAL_SCROLL, time, horizontal, horizontalDiscrete);
        sendScroll(pointer, WL_POINTER_AXIS_VERTICAL_SCROLL, time, vertical, verticalDiscrete);
    });
    m_isFrameOpen = true;
}

void Pointer::endFrame()
{
    if (!m_isFrameOpen || !m_connection.admitsEvent())
        return;
    m_isFrameOpen = false;
    m_resources.forEach([](wl_resource *pointer) {
        if (hasSince(pointer, WL_POINTER_FRAME_SINCE_VERSION))
            wl_pointer_send_frame(pointer);
    });
}

// The picture of a cursor comes without a name, so that shown or hidden is all there is to tell.
void Pointer::setCursor(wl_resource *pointer, wl_resource *surface)
{
    if (surface && !Resource::of<Surface>(surface)->takeRole(SurfaceRole::Cursor)) {
        wl_resource_post_error(pointer, WL_POINTER_ERROR_ROLE, "the surface has another role");
        return;
    }
    std::string name = surface ? "default" : "";
    if (!m_position || m_cursor == name)
        return;
    m_cursor = std::move(name);
    m_connection.delegate().cursorDidChange(*m_cursor);
}

void Pointer::sendEnter()
{
    if (m_surface.get() && m_position)
        m_resources.forEach([this](wl_resource *pointer) { sendEnter(pointer); });
}

void Pointer::sendEnter(wl_resource *pointer)
{
    if (!m_connection.admitsEvent())
        return;
    wl_pointer_send_enter(pointer, m_connection.nextInputSerial(), m_surface.get(), fixedPoint(m_position->x),
                          fixedPoint(m_position->y));
    m_isFrameOpen = true;
}

void Pointer::sendMotion()
{
    m_isMotionHeld = false;
    m_resources.forEach([this](wl_resource *pointer) {
        wl_pointer_send_motion(pointer, m_position->time, fixedPoint(m_position->x), fixedPoint(m_position->y));
    });
    m_isFrameOpen = true;
}

/** Whether something may be sent that happens where the pointer is; sees to it that the service knows where. */
bool Pointer::admitsButton()
{
    if (!m_position || !m_surface.get() || !m_connection.admitsEvent())
        return false;
    if (m_isMotionHeld)
        sendMotion();
    return true;
}

void Pointer::sendScroll(wl_resource *pointer, std::uint32_t axis, std::uint32_t time, double distance,
                         int discrete) const
{
    if (discrete != 0 && hasSince(pointer, WL_POINTER_AXIS_DISCRETE_SINCE_VERSION))
        wl_pointer_send_axis_discrete(pointer, axis, discrete);
    if (distance != 0.0)
        wl_pointer_send_axis(pointer, time, axis, fixedPoint(distance));
}

} // namespace favrin::host::server
