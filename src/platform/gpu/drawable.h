#pragma once

#include "platform/gpu/texture.h"

#include <functional>
#include <memory>

namespace favrin::platform::gpu {

/** A texture whose picture a view shows once it has been drawn. */
class Drawable
{
public:
    using Presented = std::function<void(const QImage &)>;

    Drawable(std::shared_ptr<Texture> texture, Presented presented)
        : m_texture(std::move(texture)), m_presented(std::move(presented))
    {
    }

    const std::shared_ptr<Texture> &texture() const { return m_texture; }
    /** Gives the view what was drawn. Main thread. */
    void present(const QImage &image) { m_presented(image); }

private:
    std::shared_ptr<Texture> m_texture;
    Presented m_presented;
};

} // namespace favrin::platform::gpu
