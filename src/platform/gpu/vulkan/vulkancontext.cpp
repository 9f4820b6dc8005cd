#include "platform/gpu/vulkan/vulkancontext.h"

#include <array>
#include <stdexcept>

namespace favrin::platform::gpu::vulkan {
namespace {

std::uint32_t graphicsQueueFamily(const VulkanInstance &instance)
{
    const auto *physicalDevice = instance.physicalDevice();
    if (!physicalDevice)
        throw std::runtime_error("no acceptable device");
    if (physicalDevice->getProperties().apiVersion < VK_API_VERSION_1_1)
        throw std::runtime_error("the device is too old");
    const auto families = physicalDevice->getQueueFamilyProperties();
    for (std::uint32_t index = 0; index < families.size(); ++index) {
        if (families[index].queueFlags & vk::QueueFlagBits::eGraphics)
            return index;
    }
    throw std::runtime_error("the device has no graphics queue");
}

vk::raii::Device makeDevice(const vk::raii::PhysicalDevice &physicalDevice, std::uint32_t queueFamily)
{
    const float priority = 1.0F;
    vk::DeviceQueueCreateInfo queue;
    queue.queueFamilyIndex = queueFamily;
    queue.setQueuePriorities(priority);
    vk::DeviceCreateInfo info;
    info.setQueueCreateInfos(queue);
    return physicalDevice.createDevice(info);
}

vk::raii::RenderPass makeRenderPass(const vk::raii::Device &device)
{
    vk::AttachmentDescription color;
    color.format = imageFormat;
    color.samples = vk::SampleCountFlagBits::e1;
    color.loadOp = vk::AttachmentLoadOp::eClear;
    color.storeOp = vk::AttachmentStoreOp::eStore;
    color.stencilLoadOp = vk::AttachmentLoadOp::eDontCare;
    color.stencilStoreOp = vk::AttachmentStoreOp::eDontCare;
    color.initialLayout = vk::ImageLayout::eUndefined;
    color.finalLayout = vk::ImageLayout::eTransferSrcOptimal;

    vk::AttachmentReference reference;
    reference.attachment = 0;
    reference.layout = vk::ImageLayout::eColorAttachmentOptimal;
    vk::SubpassDescription subpass;
    subpass.pipelineBindPoint = vk::PipelineBindPoint::eGraphics;
    subpass.setColorAttachments(reference);

    // The copy to the host reads what the pass has written.
    vk::SubpassDependency copy;
    copy.srcSubpass = 0;
    copy.dstSubpass = VK_SUBPASS_EXTERNAL;
    copy.srcStageMask = vk::PipelineStageFlagBits::eColorAttachmentOutput;
    copy.srcAccessMask = vk::AccessFlagBits::eColorAttachmentWrite;
    copy.dstStageMask = vk::PipelineStageFlagBits::eTransfer;
    copy.dstAccessMask = vk::AccessFlagBits::eTransferRead;

    vk::RenderPassCreateInfo info;
    info.setAttachments(color);
    info.setSubpasses(subpass);
    info.setDependencies(copy);
    return device.createRenderPass(info);
}

std::optional<std::uint32_t> memoryType(const vk::PhysicalDeviceMemoryProperties &memory, std::uint32_t types,
                                        vk::MemoryPropertyFlags flags)
{
    for (std::uint32_t index = 0; index < memory.memoryTypeCount; ++index) {
        if ((types & (1U << index)) && (memory.memoryTypes[index].propertyFlags & flags) == flags)
            return index;
    }
    return std::nullopt;
}

} // namespace

VulkanContext::VulkanContext(VulkanOptions options)
    : m_instance(std::move(options))
    , m_queueFamily(graphicsQueueFamily(m_instance))
    , m_device(makeDevice(physicalDevice(), m_queueFamily))
    , m_queue(m_device.getQueue(m_queueFamily, 0))
    , m_renderPass(makeRenderPass(m_device))
{
}

vk::raii::DeviceMemory VulkanContext::allocate(const vk::MemoryRequirements &requirements,
                                               vk::MemoryPropertyFlags required,
                                               vk::MemoryPropertyFlags preferred) const
{
    const auto memory = physicalDevice().getMemoryProperties();
    auto type = memoryType(memory, requirements.memoryTypeBits, required | preferred);
    if (!type)
        type = memoryType(memory, requirements.memoryTypeBits, required);
    if (!type)
        throw std::runtime_error("the device has no fitting memory");
    vk::MemoryAllocateInfo info;
    info.allocationSize = requirements.size;
    info.memoryTypeIndex = *type;
    return m_device.allocateMemory(info);
}

} // namespace favrin::platform::gpu::vulkan
