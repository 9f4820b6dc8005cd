#pragma once

#include "platform/gpu/vulkan/vulkaninstance.h"

#include <mutex>

namespace favrin::platform::gpu::vulkan {

/** The logical device, its one queue, and what all of its objects share. Kept alive by each of them. */
class VulkanContext
{
public:
    /** Throws as VulkanInstance does, and std::runtime_error when no device is acceptable. */
    explicit VulkanContext(VulkanOptions options);

    const vk::raii::PhysicalDevice &physicalDevice() const { return *m_instance.physicalDevice(); }
    const vk::raii::Device &device() const { return m_device; }
    /** Draws into an image of the one pixel format that there is, clearing it first, and leaves it ready for copying.
     */
    const vk::raii::RenderPass &renderPass() const { return m_renderPass; }
    std::uint32_t queueFamily() const { return m_queueFamily; }
    /** Main thread only. */
    const vk::raii::Queue &queue() const { return m_queue; }

    /**
     * Memory for a resource: of a type with all of @p required and, where there is one, all of @p preferred too. Throws
     * when there is none.
     */
    vk::raii::DeviceMemory allocate(const vk::MemoryRequirements &requirements, vk::MemoryPropertyFlags required,
                                    vk::MemoryPropertyFlags preferred) const;

private:
    VulkanInstance m_instance;
    std::uint32_t m_queueFamily;
    vk::raii::Device m_device;
    vk::raii::Queue m_queue;
    vk::raii::RenderPass m_renderPass;
};

/** The format of every image. */
inline constexpr vk::Format imageFormat = vk::Format::eB8G8R8A8Unorm;

} // namespace favrin::platform::gpu::vulkan
