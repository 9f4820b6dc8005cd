#pragma once

#include "platform/gpu/texture.h"
#include "platform/gpu/vulkan/vulkanbuffer.h"

namespace favrin::platform::gpu::vulkan {

/** An image of the device, and the buffer through which it reaches the host. */
class VulkanTexture : public Texture
{
public:
    /** Throws when it cannot be made. */
    VulkanTexture(std::shared_ptr<VulkanContext> context, QSize size);

    QSize size() const override { return m_size; }
    PixelFormat pixelFormat() const override { return PixelFormat::BGRA8Unorm; }
    QImage takeImage() override { return std::exchange(m_drawn, {}); }

    vk::Extent2D extent() const;
    const vk::raii::Framebuffer &framebuffer() const { return m_framebuffer; }
    /** Records the copy of what a render pass has drawn to where the host reads it. */
    void recordReadBack(const vk::raii::CommandBuffer &commands) const;
    /** A copy of what arrived; null when there is no memory. After the copy has completed; any thread. */
    QImage readBack() const;
    /** What takeImage() hands out next. */
    void setDrawn(QImage image) { m_drawn = std::move(image); }

private:
    std::shared_ptr<VulkanContext> m_context;
    QSize m_size;
    vk::raii::Image m_image;
    vk::raii::DeviceMemory m_memory;
    vk::raii::ImageView m_view;
    vk::raii::Framebuffer m_framebuffer;
    VulkanBuffer m_readBack;
    QImage m_drawn;
};

} // namespace favrin::platform::gpu::vulkan
