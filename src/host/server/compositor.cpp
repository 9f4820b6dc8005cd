#include "host/server/compositor.h"

#include "host/server/connection.h"
#include "host/server/region.h"
#include "host/server/surface.h"

#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

constexpr int offeredVersion = 4;

} // namespace

const void *Compositor::requests()
{
    static const struct wl_compositor_interface table = [] {
        struct wl_compositor_interface requests = {};
        requests.create_surface = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            makeResource<Surface>(client, wl_surface_interface, wl_resource_get_version(r), id,
                                  *static_cast<Compositor *>(wl_resource_get_user_data(r)));
        };
        requests.create_region = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            makeResource<Region>(client, wl_region_interface, wl_resource_get_version(r), id);
        };
        return requests;
    }();
    return &table;
}

Compositor::Compositor(Connection &connection) : m_connection(connection)
{
    offerGlobal<&Compositor::bind>(connection.display(), wl_compositor_interface, offeredVersion, this);
}

void Compositor::bind(wl_client *client, int version, std::uint32_t id)
{
    m_resources.add(client, wl_compositor_interface, version, id, requests(), this);
}

void Compositor::settleAllBut(const Surface *shown)
{
    for (Surface *surface : m_surfaces) {
        if (surface == shown)
            continue;
        surface->dropFrame();
        surface->answerFrameCallbacks(Connection::now());
    }
}

} // namespace favrin::host::server
