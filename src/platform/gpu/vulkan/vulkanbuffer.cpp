#include "platform/gpu/vulkan/vulkanbuffer.h"

namespace favrin::platform::gpu::vulkan {
namespace {

vk::raii::Buffer makeBuffer(const VulkanContext &context, std::size_t length, VulkanBuffer::Use use)
{
    vk::BufferCreateInfo info;
    info.size = length;
    info.usage = use == VulkanBuffer::Use::Vertices ? vk::BufferUsageFlagBits::eVertexBuffer
                                                    : vk::BufferUsageFlagBits::eTransferDst;
    info.sharingMode = vk::SharingMode::eExclusive;
    return context.device().createBuffer(info);
}

vk::raii::DeviceMemory makeMemory(const VulkanContext &context, const vk::raii::Buffer &buffer, VulkanBuffer::Use use)
{
    // Reading uncached memory costs the processor many times what the drawing costs the device.
    const vk::MemoryPropertyFlags preferred =
        use == VulkanBuffer::Use::ReadBack ? vk::MemoryPropertyFlagBits::eHostCached : vk::MemoryPropertyFlags();
    return context.allocate(buffer.getMemoryRequirements(),
                            vk::MemoryPropertyFlagBits::eHostVisible | vk::MemoryPropertyFlagBits::eHostCoherent,
                            preferred);
}

} // namespace

VulkanBuffer::VulkanBuffer(std::shared_ptr<VulkanContext> context, std::size_t length, Use use)
    : m_context(std::move(context))
    , m_length(length)
    , m_buffer(makeBuffer(*m_context, length, use))
    , m_memory(makeMemory(*m_context, m_buffer, use))
{
    m_buffer.bindMemory(*m_memory, 0);
    m_bytes = static_cast<std::byte *>(m_memory.mapMemory(0, VK_WHOLE_SIZE));
}

} // namespace favrin::platform::gpu::vulkan
