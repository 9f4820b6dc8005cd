#pragma once

#include "platform/gpu/renderpass.h"
#include "platform/gpu/vulkan/vulkancontext.h"

namespace favrin::platform::gpu::vulkan {

class VulkanTexture;

/** The passes of one command buffer on their way through the device. Keeps all they use until it is destroyed. */
class VulkanFrame
{
public:
    /** Records the passes and sends them off. Throws when that fails. Main thread. */
    VulkanFrame(std::shared_ptr<VulkanContext> context, std::vector<RenderPass> passes);
    /** Waits for what was sent. */
    ~VulkanFrame();
    VulkanFrame(const VulkanFrame &) = delete;
    VulkanFrame &operator=(const VulkanFrame &) = delete;

    /** Waits for the device and copies what it drew. False when that failed. Any one thread. */
    bool wait();
    /** Gives the textures what wait() copied. Main thread. */
    void deliver();

private:
    void record(const RenderPass &pass) const;
    void send() const;

    std::shared_ptr<VulkanContext> m_context;
    std::vector<RenderPass> m_passes;
    vk::raii::CommandPool m_pool;
    vk::raii::CommandBuffer m_commands;
    vk::raii::Fence m_fence;
    std::vector<QImage> m_images;
};

} // namespace favrin::platform::gpu::vulkan
