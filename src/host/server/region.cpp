#include "host/server/region.h"

#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

void ignoreRect(wl_client *, wl_resource *, std::int32_t, std::int32_t, std::int32_t, std::int32_t) {}

const struct wl_region_interface requests = {destroyRequest, ignoreRect, ignoreRect};

} // namespace

Region::Region(wl_resource *handle) : Resource(handle, &requests) {}

} // namespace favrin::host::server
