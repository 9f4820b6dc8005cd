#include "host/server/xdgpositioner.h"

#include "xdg-shell-server-protocol.h"

namespace favrin::host::server {

namespace {

void require(bool condition, wl_resource *positioner, const char *complaint)
{
    if (!condition)
        wl_resource_post_error(positioner, XDG_POSITIONER_ERROR_INVALID_INPUT, "%s", complaint);
}

} // namespace

const void *XdgPositioner::requests()
{
    static const struct xdg_positioner_interface table = [] {
        struct xdg_positioner_interface requests = {};
        requests.destroy = destroyRequest;
        requests.set_size = [](wl_client *, wl_resource *r, std::int32_t width, std::int32_t height) {
            require(width > 0 && height > 0, r, "a size that is not positive");
        };
        requests.set_anchor_rect = [](wl_client *, wl_resource *r, std::int32_t, std::int32_t, std::int32_t width,
                                      std::int32_t height) {
            require(width >= 0 && height >= 0, r, "a negative anchor rectangle");
        };
        requests.set_anchor = [](wl_client *, wl_resource *r, std::uint32_t anchor) {
            require(anchor <= XDG_POSITIONER_ANCHOR_BOTTOM_RIGHT, r, "an unknown anchor");
        };
        requests.set_gravity = [](wl_client *, wl_resource *r, std::uint32_t gravity) {
            require(gravity <= XDG_POSITIONER_GRAVITY_BOTTOM_RIGHT, r, "an unknown gravity");
        };
        requests.set_constraint_adjustment = [](wl_client *, wl_resource *, std::uint32_t) {};
        requests.set_offset = [](wl_client *, wl_resource *, std::int32_t, std::int32_t) {};
        return requests;
    }();
    return &table;
}

XdgPositioner::XdgPositioner(wl_resource *handle) : Resource(handle, requests()) {}

} // namespace favrin::host::server
