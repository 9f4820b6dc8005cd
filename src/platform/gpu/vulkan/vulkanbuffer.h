#pragma once

#include "platform/gpu/buffer.h"
#include "platform/gpu/vulkan/vulkancontext.h"

namespace favrin::platform::gpu::vulkan {

/** A buffer that the host can see, mapped for as long as it lives. */
class VulkanBuffer : public Buffer
{
public:
    enum class Use { Vertices, ReadBack };

    /** Throws when it cannot be made. */
    VulkanBuffer(std::shared_ptr<VulkanContext> context, std::size_t length, Use use);

    std::size_t length() const override { return m_length; }
    const vk::raii::Buffer &buffer() const { return m_buffer; }
    /** What the device has written, or will read; the memory needs no flushing. */
    std::byte *bytes() const { return m_bytes; }

private:
    std::shared_ptr<VulkanContext> m_context;
    std::size_t m_length;
    vk::raii::Buffer m_buffer;
    vk::raii::DeviceMemory m_memory;
    std::byte *m_bytes;
};

} // namespace favrin::platform::gpu::vulkan
