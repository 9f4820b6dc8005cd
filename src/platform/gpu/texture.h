#pragma once

#include "platform/gpu/pixelformat.h"

#include <QImage>

namespace favrin::platform::gpu {

/** A picture that a device can draw into. Made by a Device. */
class Texture
{
public:
    virtual ~Texture() = default;
    virtual QSize size() const = 0;
    virtual PixelFormat pixelFormat() const = 0;
    /**
     * Hands out what was drawn, as Format_ARGB32_Premultiplied, leaving the texture without it. Null before a command
     * buffer that drew into the texture has completed. Main thread.
     */
    virtual QImage takeImage() = 0;
};

} // namespace favrin::platform::gpu
