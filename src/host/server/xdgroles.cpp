#include "host/server/xdgroles.h"

#include "host/server/xdgsurface.h"
#include "xdg-shell-server-protocol.h"

namespace favrin::host::server {

namespace {

void checkSize(wl_client *, wl_resource *toplevel, std::int32_t width, std::int32_t height)
{
    if (width < 0 || height < 0)
        wl_resource_post_error(toplevel, XDG_TOPLEVEL_ERROR_INVALID_SIZE, "a negative size");
}

void ignore(wl_client *, wl_resource *) {}

} // namespace

const void *XdgToplevel::requests()
{
    static const struct xdg_toplevel_interface table = [] {
        struct xdg_toplevel_interface requests = {};
        requests.destroy = destroyRequest;
        requests.set_parent = [](wl_client *, wl_resource *, wl_resource *) {};
        requests.set_title = [](wl_client *, wl_resource *, const char *) {};
        requests.set_app_id = [](wl_client *, wl_resource *, const char *) {};
        requests.show_window_menu = [](wl_client *, wl_resource *, wl_resource *, std::uint32_t, std::int32_t,
                                       std::int32_t) {};
        requests.move = [](wl_client *, wl_resource *, wl_resource *, std::uint32_t) {};
        requests.resize = [](wl_client *, wl_resource *, wl_resource *, std::uint32_t, std::uint32_t) {};
        requests.set_max_size = checkSize;
        requests.set_min_size = checkSize;
        requests.set_maximized = ignore;
        requests.unset_maximized = ignore;
        requests.set_fullscreen = [](wl_client *, wl_resource *, wl_resource *) {};
        requests.unset_fullscreen = ignore;
        requests.set_minimized = ignore;
        return requests;
    }();
    return &table;
}

XdgToplevel::XdgToplevel(wl_resource *handle, XdgSurface &surface) : Resource(handle, requests())
{
    m_surface.reset(surface.handle());
}

XdgToplevel::~XdgToplevel()
{
    if (auto *surface = m_surface.as<XdgSurface>())
        surface->toplevelWillGo();
}

const void *XdgPopup::requests()
{
    static const struct xdg_popup_interface table = [] {
        struct xdg_popup_interface requests = {};
        requests.destroy = destroyRequest;
        requests.grab = [](wl_client *, wl_resource *, wl_resource *, std::uint32_t) {};
        return requests;
    }();
    return &table;
}

XdgPopup::XdgPopup(wl_resource *handle) : Resource(handle, requests()) {}

} // namespace favrin::host::server
