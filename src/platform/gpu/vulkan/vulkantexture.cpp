#include "platform/gpu/vulkan/vulkantexture.h"

#include <cstring>

namespace favrin::platform::gpu::vulkan {
namespace {

constexpr std::size_t bytesPerPixel = 4;

vk::Extent2D extentOf(QSize size)
{
    vk::Extent2D extent;
    extent.width = static_cast<std::uint32_t>(size.width());
    extent.height = static_cast<std::uint32_t>(size.height());
    return extent;
}

std::size_t byteCount(QSize size)
{
    return static_cast<std::size_t>(size.width()) * static_cast<std::size_t>(size.height()) * bytesPerPixel;
}

vk::raii::Image makeImage(const VulkanContext &context, vk::Extent2D extent)
{
    vk::ImageCreateInfo info;
    info.imageType = vk::ImageType::e2D;
    info.format = imageFormat;
    info.extent.width = extent.width;
    info.extent.height = extent.height;
    info.extent.depth = 1;
    info.mipLevels = 1;
    info.arrayLayers = 1;
    info.samples = vk::SampleCountFlagBits::e1;
    info.tiling = vk::ImageTiling::eOptimal;
    info.usage = vk::ImageUsageFlagBits::eColorAttachment | vk::ImageUsageFlagBits::eTransferSrc;
    info.sharingMode = vk::SharingMode::eExclusive;
    info.initialLayout = vk::ImageLayout::eUndefined;
    return context.device().createImage(info);
}

vk::raii::DeviceMemory makeMemory(const VulkanContext &context, const vk::raii::Image &image)
{
    vk::raii::DeviceMemory memory =
        context.allocate(image.getMemoryRequirements(), {}, vk::MemoryPropertyFlagBits::eDeviceLocal);
    image.bindMemory(*memory, 0);
    return memory;
}

vk::raii::ImageView makeView(const VulkanContext &context, const vk::raii::Image &image)
{
    vk::ImageViewCreateInfo info;
    info.image = *image;
    info.viewType = vk::ImageViewType::e2D;
    info.format = imageFormat;
    info.subresourceRange.aspectMask = vk::ImageAspectFlagBits::eColor;
    info.subresourceRange.levelCount = 1;
    info.subresourceRange.layerCount = 1;
    return context.device().createImageView(info);
}

vk::raii::Framebuffer makeFramebuffer(const VulkanContext &context, const vk::raii::ImageView &view,
                                      vk::Extent2D extent)
{
    vk::FramebufferCreateInfo info;
    info.renderPass = *context.renderPass();
    const vk::ImageView attachment = *view;
    info.setAttachments(attachment);
    info.width = extent.width;
    info.height = extent.height;
    info.layers = 1;
    return context.device().createFramebuffer(info);
}

} // namespace

VulkanTexture::VulkanTexture(std::shared_ptr<VulkanContext> context, QSize size)
    : m_context(std::move(context))
    , m_size(size)
    , m_image(makeImage(*m_context, extent()))
    , m_memory(makeMemory(*m_context, m_image))
    , m_view(makeView(*m_context, m_image))
    , m_framebuffer(makeFramebuffer(*m_context, m_view, extent()))
    , m_readBack(m_context, byteCount(size), VulkanBuffer::Use::ReadBack)
{
}

vk::Extent2D VulkanTexture::extent() const
{
    return extentOf(m_size);
}

void VulkanTexture::recordReadBack(const vk::raii::CommandBuffer &commands) const
{
    vk::BufferImageCopy region;
    region.imageSubresource.aspectMask = vk::ImageAspectFlagBits::eColor;
    region.imageSubresource.layerCount = 1;
    region.imageExtent.width = extent().width;
    region.imageExtent.height = extent().height;
    region.imageExtent.depth = 1;
    commands.copyImageToBuffer(*m_image, vk::ImageLayout::eTransferSrcOptimal, *m_readBack.buffer(), region);

    vk::MemoryBarrier visibleToHost;
    visibleToHost.srcAccessMask = vk::AccessFlagBits::eTransferWrite;
    visibleToHost.dstAccessMask = vk::AccessFlagBits::eHostRead;
    commands.pipelineBarrier(vk::PipelineStageFlagBits::eTransfer, vk::PipelineStageFlagBits::eHost, {}, visibleToHost,
                             {}, {});
}

QImage VulkanTexture::readBack() const
{
    QImage image(m_size, QImage::Format_ARGB32_Premultiplied);
    if (image.isNull())
        return image;
    const std::size_t lineLength = static_cast<std::size_t>(m_size.width()) * bytesPerPixel;
    const std::byte *line = m_readBack.bytes();
    for (int y = 0; y < m_size.height(); ++y, line += lineLength)
        std::memcpy(image.scanLine(y), line, lineLength);
    return image;
}

} // namespace favrin::platform::gpu::vulkan
