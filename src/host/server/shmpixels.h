#pragma once

#include <functional>

#include <wayland-server-core.h>

namespace favrin::host::server {

/** The pixels of a shared-memory buffer, as they may be read during one call. */
struct ShmPixels
{
    const unsigned char *data = nullptr;
    int width = 0;
    int height = 0;
    int stride = 0;
    bool opaque = false;
};

/** Posts an error and returns false when the rows of @p buffer overlap or leave the pool, or its pixels are not
 * aligned. */
bool checkShmBuffer(wl_resource *buffer);

/**
 * Calls @p read with the pixels of @p buffer, a checked one. A pool that its owner has cut short reads as zero, and the
 * client gets the error that ends it; this process is not hurt.
 */
void readShmBuffer(wl_resource *buffer, const std::function<void(const ShmPixels &)> &read);

} // namespace favrin::host::server
