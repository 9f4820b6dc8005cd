#include "host/server/output.h"

#include "host/server/connection.h"
#include "remote/limits.h"

#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

constexpr int offeredVersion = 3;
constexpr int refreshMillihertz = 60000;

/** The size of this many points at 96 points per inch. */
int millimeters(int points)
{
    return points * 254 / 960;
}

} // namespace

const void *Output::requests()
{
    static const struct wl_output_interface table = [] {
        struct wl_output_interface requests = {};
        requests.release = destroyRequest;
        return requests;
    }();
    return &table;
}

Output::Output(Connection &connection, int scale, std::function<void()> onBound)
    : m_connection(connection), m_scale(scale), m_onBound(std::move(onBound))
{
    offerGlobal<&Output::bind>(connection.display(), wl_output_interface, offeredVersion, this);
}

void Output::enter(wl_resource *surface)
{
    if (m_connection.admitsEvent())
        m_resources.forEach([&](wl_resource *output) { wl_surface_send_enter(surface, output); });
}

void Output::leave(wl_resource *surface)
{
    if (m_connection.admitsEvent())
        m_resources.forEach([&](wl_resource *output) { wl_surface_send_leave(surface, output); });
}

void Output::bind(wl_client *client, int version, std::uint32_t id)
{
    wl_resource *output = m_resources.add(client, wl_output_interface, version, id, requests(), this);
    if (!output)
        return;
    describe(output);
    m_onBound();
}

void Output::describe(wl_resource *output)
{
    if (!m_connection.admitsEvent())
        return;
    constexpr int points = remote::limits::largestSurface;
    wl_output_send_geometry(output, 0, 0, millimeters(points), millimeters(points), WL_OUTPUT_SUBPIXEL_NONE, "Favrin",
                            "host", WL_OUTPUT_TRANSFORM_NORMAL);
    wl_output_send_mode(output, WL_OUTPUT_MODE_CURRENT | WL_OUTPUT_MODE_PREFERRED, points * m_scale, points * m_scale,
                        refreshMillihertz);
    if (wl_resource_get_version(output) < WL_OUTPUT_DONE_SINCE_VERSION)
        return;
    wl_output_send_scale(output, m_scale);
    wl_output_send_done(output);
}

} // namespace favrin::host::server
