#pragma once

namespace favrin::platform::gpu {

/** What a pixel of a texture holds. */
enum class PixelFormat {
    Invalid,
    /** Blue, green, red, alpha, a byte each in this order in memory; 0…1 as 0…255, alpha premultiplied. */
    BGRA8Unorm
};

} // namespace favrin::platform::gpu
