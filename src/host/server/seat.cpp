#include "host/server/seat.h"

#include "host/server/connection.h"

#include <utility>

#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

constexpr int offeredVersion = 7;

Seat &seatOf(wl_resource *resource)
{
    return *static_cast<Seat *>(wl_resource_get_user_data(resource));
}

} // namespace

const void *Seat::requests()
{
    static const struct wl_seat_interface table = [] {
        struct wl_seat_interface requests = {};
        requests.get_pointer = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            seatOf(r).m_pointer.bind(client, wl_resource_get_version(r), id);
        };
        requests.get_keyboard = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            seatOf(r).m_keyboard.bind(client, wl_resource_get_version(r), id);
        };
        requests.get_touch = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            seatOf(r).m_touch.bind(client, wl_resource_get_version(r), id);
        };
        requests.release = destroyRequest;
        return requests;
    }();
    return &table;
}

Seat::Seat(Connection &connection) : m_pointer(connection), m_keyboard(connection), m_touch(connection)
{
    offerGlobal<&Seat::bind>(connection.display(), wl_seat_interface, offeredVersion, this);
}

void Seat::bind(wl_client *client, int version, std::uint32_t id)
{
    wl_resource *seat = m_resources.add(client, wl_seat_interface, version, id, requests(), this);
    if (!seat)
        return;
    sendCapabilities(seat);
    if (version >= WL_SEAT_NAME_SINCE_VERSION)
        wl_seat_send_name(seat, "host");
}

void Seat::offerKeyboard()
{
    if (!std::exchange(m_hasKeyboard, true))
        m_resources.forEach([this](wl_resource *seat) { sendCapabilities(seat); });
}

void Seat::sendCapabilities(wl_resource *seat) const
{
    std::uint32_t capabilities = WL_SEAT_CAPABILITY_POINTER | WL_SEAT_CAPABILITY_TOUCH;
    if (m_hasKeyboard)
        capabilities |= WL_SEAT_CAPABILITY_KEYBOARD;
    wl_seat_send_capabilities(seat, capabilities);
}

void Seat::setSurface(Surface *surface)
{
    m_pointer.setSurface(surface);
    m_keyboard.setSurface(surface);
    m_touch.setSurface(surface);
}

void Seat::settle()
{
    m_pointer.sendHeldMotion();
    m_pointer.endFrame();
    m_touch.sendHeldMotion();
    m_touch.endFrame();
}

} // namespace favrin::host::server
