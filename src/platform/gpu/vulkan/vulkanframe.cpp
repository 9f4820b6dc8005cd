#include "platform/gpu/vulkan/vulkanframe.h"

#include "platform/gpu/gpulog.h"
#include "platform/gpu/vulkan/vulkanrenderpipeline.h"
#include "platform/gpu/vulkan/vulkantexture.h"

#include <chrono>

namespace favrin::platform::gpu::vulkan {
namespace {

/** A device that takes longer for a frame has hung; the driver would say so later. */
constexpr std::chrono::nanoseconds patience = std::chrono::seconds(10);

vk::raii::CommandPool makePool(const VulkanContext &context)
{
    vk::CommandPoolCreateInfo info;
    info.flags = vk::CommandPoolCreateFlagBits::eTransient;
    info.queueFamilyIndex = context.queueFamily();
    return context.device().createCommandPool(info);
}

vk::raii::CommandBuffer makeCommands(const VulkanContext &context, const vk::raii::CommandPool &pool)
{
    vk::CommandBufferAllocateInfo info;
    info.commandPool = *pool;
    info.level = vk::CommandBufferLevel::ePrimary;
    info.commandBufferCount = 1;
    return std::move(context.device().allocateCommandBuffers(info).front());
}

VulkanTexture &textureOf(const RenderPass &pass)
{
    return static_cast<VulkanTexture &>(*pass.descriptor.colorAttachments[0].texture);
}

vk::ClearValue clearValue(const ClearColor &color)
{
    vk::ClearValue value;
    value.color.float32[0] = static_cast<float>(color.red);
    value.color.float32[1] = static_cast<float>(color.green);
    value.color.float32[2] = static_cast<float>(color.blue);
    value.color.float32[3] = static_cast<float>(color.alpha);
    return value;
}

/** With y up, as vertex functions have it; the interface's own y runs down. */
vk::Viewport viewportWithYUp(vk::Extent2D extent)
{
    vk::Viewport viewport;
    viewport.y = static_cast<float>(extent.height);
    viewport.width = static_cast<float>(extent.width);
    viewport.height = -static_cast<float>(extent.height);
    viewport.maxDepth = 1.0F;
    return viewport;
}

void recordDraw(const vk::raii::CommandBuffer &commands, const DrawCommand &draw)
{
    const auto &pipeline = static_cast<const VulkanRenderPipelineState &>(*draw.pipelineState);
    const auto &buffer = static_cast<const VulkanBuffer &>(*draw.vertexBuffer);
    commands.bindPipeline(vk::PipelineBindPoint::eGraphics, *pipeline.pipeline());
    commands.bindVertexBuffers(0, *buffer.buffer(), vk::DeviceSize(draw.vertexBufferOffset));
    commands.draw(draw.vertexCount, 1, draw.vertexStart, 0);
}

} // namespace

VulkanFrame::VulkanFrame(std::shared_ptr<VulkanContext> context, std::vector<RenderPass> passes)
    : m_context(std::move(context))
    , m_passes(std::move(passes))
    , m_pool(makePool(*m_context))
    , m_commands(makeCommands(*m_context, m_pool))
    , m_fence(m_context->device().createFence(vk::FenceCreateInfo()))
{
    vk::CommandBufferBeginInfo begin;
    begin.flags = vk::CommandBufferUsageFlagBits::eOneTimeSubmit;
    m_commands.begin(begin);
    for (const RenderPass &pass : m_passes)
        record(pass);
    m_commands.end();
    send();
}

VulkanFrame::~VulkanFrame()
{
    try {
        // What the device still uses must not go.
        static_cast<void>(
            m_context->device().waitForFences(*m_fence, VK_TRUE, static_cast<std::uint64_t>(patience.count())));
    } catch (const vk::SystemError &) {
        // A lost device uses nothing any more.
    }
}

void VulkanFrame::record(const RenderPass &pass) const
{
    const VulkanTexture &texture = textureOf(pass);
    const vk::ClearValue clear = clearValue(pass.descriptor.colorAttachments[0].clearColor);
    vk::Rect2D area;
    area.extent = texture.extent();
    vk::RenderPassBeginInfo begin;
    begin.renderPass = *m_context->renderPass();
    begin.framebuffer = *texture.framebuffer();
    begin.renderArea = area;
    begin.setClearValues(clear);
    m_commands.beginRenderPass(begin, vk::SubpassContents::eInline);
    m_commands.setViewport(0, viewportWithYUp(area.extent));
    m_commands.setScissor(0, area);
    for (const DrawCommand &draw : pass.draws)
        recordDraw(m_commands, draw);
    m_commands.endRenderPass();
    texture.recordReadBack(m_commands);
}

void VulkanFrame::send() const
{
    const vk::CommandBuffer commands = *m_commands;
    vk::SubmitInfo submission;
    submission.setCommandBuffers(commands);
    m_context->queue().submit(submission, *m_fence);
}

bool VulkanFrame::wait()
{
    try {
        const auto result =
            m_context->device().waitForFences(*m_fence, VK_TRUE, static_cast<std::uint64_t>(patience.count()));
        if (result != vk::Result::eSuccess)
            return false;
        for (const RenderPass &pass : m_passes)
            m_images.push_back(textureOf(pass).readBack());
        return true;
    } catch (const vk::SystemError &error) {
        gpuLog().warning(std::string("The GPU did not finish a frame: ") + error.what());
        return false;
    }
}

void VulkanFrame::deliver()
{
    for (std::size_t index = 0; index < m_images.size(); ++index)
        textureOf(m_passes[index]).setDrawn(std::move(m_images[index]));
}

} // namespace favrin::platform::gpu::vulkan
