#include "host/server/shmpixels.h"

#include <cstdint>

#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

constexpr int bytesPerPixel = 4;

} // namespace

// libwayland compares the stride with the width in pixels only, so that the last row could lie outside of the pool.
bool checkShmBuffer(wl_resource *buffer)
{
    wl_shm_buffer *shm = wl_shm_buffer_get(buffer);
    if (!shm) {
        wl_resource_post_error(buffer, WL_SHM_ERROR_INVALID_FORMAT, "not a shared-memory buffer");
        return false;
    }
    const int stride = wl_shm_buffer_get_stride(shm);
    wl_shm_buffer_begin_access(shm);
    const auto address = reinterpret_cast<std::uintptr_t>(wl_shm_buffer_get_data(shm));
    wl_shm_buffer_end_access(shm);
    if (stride / bytesPerPixel < wl_shm_buffer_get_width(shm) || stride % bytesPerPixel != 0 ||
        address % bytesPerPixel != 0) {
        wl_resource_post_error(buffer, WL_SHM_ERROR_INVALID_STRIDE, "rows of %d bytes cannot hold the pixels", stride);
        return false;
    }
    return true;
}

void readShmBuffer(wl_resource *buffer, const std::function<void(const ShmPixels &)> &read)
{
    wl_shm_buffer *shm = wl_shm_buffer_get(buffer);
    wl_shm_buffer_begin_access(shm);
    read({static_cast<const unsigned char *>(wl_shm_buffer_get_data(shm)), wl_shm_buffer_get_width(shm),
          wl_shm_buffer_get_height(shm), wl_shm_buffer_get_stride(shm),
          wl_shm_buffer_get_format(shm) == WL_SHM_FORMAT_XRGB8888});
    wl_shm_buffer_end_access(shm);
}

} // namespace favrin::host::server
