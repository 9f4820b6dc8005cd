#include "host/server/xdgshell.h"

#include "host/server/connection.h"
#include "host/server/screens.h"
#include "host/server/surface.h"
#include "host/server/xdgpositioner.h"
#include "host/server/xdgsurface.h"
#include "remote/limits.h"
#include "xdg-shell-server-protocol.h"

#include <algorithm>
#include <utility>

namespace favrin::host::server {

namespace {

constexpr int offeredVersion = 2;

XdgShell &shellOf(wl_resource *resource)
{
    return *static_cast<XdgShell *>(wl_resource_get_user_data(resource));
}

} // namespace

const void *XdgShell::requests()
{
    static const struct xdg_wm_base_interface table = [] {
        struct xdg_wm_base_interface requests = {};
        requests.destroy = destroyRequest;
        requests.create_positioner = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            makeResource<XdgPositioner>(client, xdg_positioner_interface, wl_resource_get_version(r), id);
        };
        requests.get_xdg_surface = [](wl_client *client, wl_resource *r, std::uint32_t id, wl_resource *surface) {
            shellOf(r).makeXdgSurface(client, r, id, surface);
        };
        requests.pong = [](wl_client *, wl_resource *r, std::uint32_t serial) { shellOf(r).pong(serial); };
        return requests;
    }();
    return &table;
}

XdgShell::XdgShell(Connection &connection, Screens &screens) : m_connection(connection), m_screens(screens)
{
    offerGlobal<&XdgShell::bind>(connection.display(), xdg_wm_base_interface, offeredVersion, this);
}

void XdgShell::bind(wl_client *client, int version, std::uint32_t id)
{
    wl_resource *shell = m_resources.add(client, xdg_wm_base_interface, version, id, requests(), this);
    if (shell && m_openPing != 0)
        xdg_wm_base_send_ping(shell, m_openPing);
}

void XdgShell::configure(int width, int height)
{
    const int oldWidth = std::exchange(m_width, std::clamp(width, 1, remote::limits::largestSurface));
    const int oldHeight = std::exchange(m_height, std::clamp(height, 1, remote::limits::largestSurface));
    // A service draws a new frame for whatever it is told.
    if (m_toplevel && (m_width != oldWidth || m_height != oldHeight))
        m_toplevel->reconfigure();
}

void XdgShell::setActivated(bool activated)
{
    if (activated == m_activated)
        return;
    m_activated = activated;
    if (m_toplevel)
        m_toplevel->reconfigure();
}

void XdgShell::ping()
{
    if (m_openPing != 0) {
        if (std::exchange(m_responsive, false))
            m_connection.delegate().serviceResponsivenessDidChange(false);
        return;
    }
    if (!m_connection.admitsEvent())
        return;
    // Of a service that has not come so far as to bind the shell, the question is open until it has.
    m_openPing = m_connection.nextSerial();
    m_resources.forEach([this](wl_resource *shell) { xdg_wm_base_send_ping(shell, m_openPing); });
}

void XdgShell::pong(std::uint32_t serial)
{
    if (serial != m_openPing)
        return;
    m_openPing = 0;
    if (!std::exchange(m_responsive, true))
        m_connection.delegate().serviceResponsivenessDidChange(true);
}

bool XdgShell::adopt(XdgSurface &toplevel)
{
    if (m_toplevel)
        return false;
    m_toplevel = &toplevel;
    m_screens.setSurface(toplevel.surface()->handle());
    return true;
}

void XdgShell::toplevelDidChange(XdgSurface &toplevel, Surface *mapped)
{
    if (&toplevel == m_toplevel)
        setMapped(mapped);
}

void XdgShell::toplevelWillGo(XdgSurface &toplevel)
{
    if (&toplevel != m_toplevel)
        return;
    setMapped(nullptr);
    m_toplevel = nullptr;
}

void XdgShell::makeXdgSurface(wl_client *client, wl_resource *shell, std::uint32_t id, wl_resource *surface)
{
    Surface &content = *Resource::of<Surface>(surface);
    if (content.role() != SurfaceRole::None && content.role() != SurfaceRole::Toplevel &&
        content.role() != SurfaceRole::Popup) {
        wl_resource_post_error(shell, XDG_WM_BASE_ERROR_ROLE, "the surface has another role");
        return;
    }
    if (content.hasContent() || content.hasObserver()) {
        wl_resource_post_error(shell, XDG_WM_BASE_ERROR_INVALID_SURFACE_STATE, "the surface is in use");
        return;
    }
    makeResource<XdgSurface>(client, xdg_surface_interface, wl_resource_get_version(shell), id, *this, content);
}

void XdgShell::setMapped(Surface *surface)
{
    if (surface == m_mapped)
        return;
    m_mapped = surface;
    if (m_mappedChanged)
        m_mappedChanged();
}

} // namespace favrin::host::server
