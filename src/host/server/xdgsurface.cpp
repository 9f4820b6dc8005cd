#include "host/server/xdgsurface.h"

#include "host/server/connection.h"
#include "host/server/xdgroles.h"
#include "host/server/xdgshell.h"
#include "xdg-shell-server-protocol.h"

#include <utility>

namespace favrin::host::server {

namespace {

XdgSurface &xdgSurfaceOf(wl_resource *resource)
{
    return *Resource::of<XdgSurface>(resource);
}

} // namespace

const void *XdgSurface::requests()
{
    static const struct xdg_surface_interface table = [] {
        struct xdg_surface_interface requests = {};
        requests.destroy = destroyRequest;
        requests.get_toplevel = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            xdgSurfaceOf(r).makeToplevel(client, id);
        };
        requests.get_popup = [](wl_client *client, wl_resource *r, std::uint32_t id, wl_resource *, wl_resource *) {
            xdgSurfaceOf(r).makePopup(client, id);
        };
        // The host shows the whole surface, whatever part of it the service calls its window.
        requests.set_window_geometry = [](wl_client *, wl_resource *, std::int32_t, std::int32_t, std::int32_t,
                                          std::int32_t) {};
        requests.ack_configure = [](wl_client *, wl_resource *r, std::uint32_t serial) {
            xdgSurfaceOf(r).acknowledge(serial);
        };
        return requests;
    }();
    return &table;
}

XdgSurface::XdgSurface(wl_resource *handle, XdgShell &shell, Surface &surface)
    : Resource(handle, requests()), m_shell(shell)
{
    m_surface.reset(surface.handle());
    surface.setObserver(this);
}

XdgSurface::~XdgSurface()
{
    m_shell.toplevelWillGo(*this);
    if (Surface *content = surface())
        content->setObserver(nullptr);
}

void XdgSurface::reconfigure()
{
    if (m_stage == Stage::New || !m_roleObject.get())
        return;
    if (m_openConfigure != 0)
        m_configureAgain = true;
    else
        sendConfigure();
}

bool XdgSurface::surfaceMayCommit(bool withBuffer)
{
    if (!m_roleObject.get()) {
        wl_resource_post_error(handle(), XDG_SURFACE_ERROR_NOT_CONSTRUCTED, "a commit before the role object was made");
        return false;
    }
    if (withBuffer && m_stage != Stage::Configured) {
        wl_resource_post_error(handle(), XDG_SURFACE_ERROR_UNCONFIGURED_BUFFER, "a buffer before the first configure");
        return false;
    }
    return true;
}

void XdgSurface::surfaceDidCommit()
{
    if (!m_isPicker)
        return;
    Surface *content = surface();
    m_shell.toplevelDidChange(*this, content->hasContent() ? content : nullptr);
    if (content->hasContent())
        m_wasMapped = true;
    else if (std::exchange(m_wasMapped, false))
        restart();
    else if (m_stage == Stage::New)
        sendConfigure();
}

void XdgSurface::surfaceWillGo()
{
    m_shell.toplevelWillGo(*this);
    m_isPicker = false;
}

void XdgSurface::makeToplevel(wl_client *client, std::uint32_t id)
{
    if (!takeRole(SurfaceRole::Toplevel))
        return;
    auto *toplevel =
        makeResource<XdgToplevel>(client, xdg_toplevel_interface, wl_resource_get_version(handle()), id, *this);
    if (!toplevel)
        return;
    m_roleObject.reset(toplevel->handle());
    m_isPicker = m_shell.adopt(*this);
    if (!m_isPicker && m_shell.connection().admitsEvent())
        xdg_toplevel_send_close(toplevel->handle());
}

void XdgSurface::makePopup(wl_client *client, std::uint32_t id)
{
    if (!takeRole(SurfaceRole::Popup))
        return;
    auto *popup = makeResource<XdgPopup>(client, xdg_popup_interface, wl_resource_get_version(handle()), id);
    if (!popup)
        return;
    m_roleObject.reset(popup->handle());
    if (m_shell.connection().admitsEvent())
        xdg_popup_send_popup_done(popup->handle());
}

void XdgSurface::toplevelWillGo()
{
    m_shell.toplevelWillGo(*this);
    m_isPicker = false;
    restart();
}

bool XdgSurface::takeRole(SurfaceRole role)
{
    if (m_roleObject.get()) {
        wl_resource_post_error(handle(), XDG_SURFACE_ERROR_ALREADY_CONSTRUCTED, "a second role object");
        return false;
    }
    if (!surface() || !surface()->takeRole(role)) {
        wl_resource_post_error(handle(), XDG_SURFACE_ERROR_NOT_CONSTRUCTED, "the surface cannot take this role");
        return false;
    }
    return true;
}

void XdgSurface::acknowledge(std::uint32_t serial)
{
    if (serial != 0 && serial == std::exchange(m_retiredConfigure, 0))
        return;
    if (m_openConfigure == 0 || serial != m_openConfigure) {
        wl_resource_post_error(handle(), XDG_SURFACE_ERROR_INVALID_SERIAL, "serial %u was not sent", serial);
        return;
    }
    m_openConfigure = 0;
    m_stage = Stage::Configured;
    if (std::exchange(m_configureAgain, false))
        sendConfigure();
}

void XdgSurface::sendConfigure()
{
    if (!m_shell.connection().admitsEvent())
        return;
    std::uint32_t activated = XDG_TOPLEVEL_STATE_ACTIVATED;
    wl_array states = {m_shell.isActivated() ? sizeof activated : 0, 0, &activated};
    xdg_toplevel_send_configure(m_roleObject.get(), m_shell.width(), m_shell.height(), &states);
    m_openConfigure = m_shell.connection().nextSerial();
    xdg_surface_send_configure(handle(), m_openConfigure);
    if (m_stage == Stage::New)
        m_stage = Stage::Configuring;
}

/** An unmapped toplevel begins anew: first an empty commit, then a configure. */
void XdgSurface::restart()
{
    m_stage = Stage::New;
    m_retiredConfigure = std::exchange(m_openConfigure, 0);
    m_configureAgain = false;
}

} // namespace favrin::host::server
