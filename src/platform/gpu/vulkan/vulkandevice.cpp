#include "platform/gpu/vulkan/vulkandevice.h"

#include "platform/gpu/defaultlibrary.h"
#include "platform/gpu/gpulog.h"
#include "platform/gpu/vulkan/vulkanframe.h"
#include "platform/gpu/vulkan/vulkanrenderpipeline.h"
#include "platform/gpu/vulkan/vulkantexture.h"
#include "platform/queue/queue.h"

#include <cstring>

namespace favrin::platform::gpu::vulkan {
namespace {

/** Makes something of the interface, which reports failure by throwing; null with the reason logged when it fails. */
template<class Make>
auto madeOrLogged(const char *what, Make make) -> decltype(make())
{
    try {
        return make();
    } catch (const std::exception &error) {
        gpuLog().warning(std::string("The GPU could not make ") + what + ": " + error.what());
        return nullptr;
    }
}

} // namespace

std::shared_ptr<VulkanDevice> VulkanDevice::create(VulkanOptions options, std::string *reason)
{
    try {
        return std::make_shared<VulkanDevice>(std::make_shared<VulkanContext>(std::move(options)));
    } catch (const std::exception &error) {
        if (reason)
            *reason = error.what();
        return nullptr;
    }
}

VulkanDevice::VulkanDevice(std::shared_ptr<VulkanContext> context) : m_context(std::move(context)) {}

VulkanDevice::~VulkanDevice() = default;

std::string VulkanDevice::name() const
{
    return m_context->physicalDevice().getProperties().deviceName.data();
}

Device::Kind VulkanDevice::kind() const
{
    const auto type = m_context->physicalDevice().getProperties().deviceType;
    return type == vk::PhysicalDeviceType::eCpu ? Kind::Software : Kind::Hardware;
}

std::shared_ptr<Buffer> VulkanDevice::makeBuffer(std::span<const std::byte> bytes)
{
    return madeOrLogged("a buffer", [&]() -> std::shared_ptr<Buffer> {
        auto buffer = std::make_shared<VulkanBuffer>(m_context, bytes.size(), VulkanBuffer::Use::Vertices);
        std::memcpy(buffer->bytes(), bytes.data(), bytes.size());
        return buffer;
    });
}

std::shared_ptr<Library> VulkanDevice::makeDefaultLibrary()
{
    return std::make_shared<VulkanLibrary>(m_context, defaultLibraryContents().spirvFolder);
}

std::shared_ptr<Texture> VulkanDevice::makeTexture(QSize size, PixelFormat format)
{
    if (size.isEmpty() || format == PixelFormat::Invalid)
        return nullptr;
    return madeOrLogged("a texture",
                        [&]() -> std::shared_ptr<Texture> { return std::make_shared<VulkanTexture>(m_context, size); });
}

std::shared_ptr<RenderPipelineState> VulkanDevice::makeRenderPipelineState(const RenderPipelineDescriptor &descriptor,
                                                                           std::string *error)
{
    const auto vertexFunction = std::dynamic_pointer_cast<VulkanFunction>(descriptor.vertexFunction);
    const auto fragmentFunction = std::dynamic_pointer_cast<VulkanFunction>(descriptor.fragmentFunction);
    const auto failed = [error](const char *reason) {
        if (error)
            *error = reason;
        return nullptr;
    };
    if (!vertexFunction || !fragmentFunction)
        return failed("a shader function is missing");
    const auto floats = descriptor.vertexDescriptor.floatsPerVertex;
    if (floats < 1 || floats > 4 || descriptor.colorAttachments[0].pixelFormat == PixelFormat::Invalid)
        return failed("the vertices or the pixels have no format");
    try {
        return std::make_shared<VulkanRenderPipelineState>(m_context, *vertexFunction, *fragmentFunction,
                                                           descriptor.vertexDescriptor);
    } catch (const std::exception &exception) {
        return failed(exception.what());
    }
}

void VulkanDevice::submit(std::vector<RenderPass> passes, CompletedHandler completed)
{
    auto frame = madeOrLogged("a frame", [&] { return std::make_shared<VulkanFrame>(m_context, std::move(passes)); });
    if (!frame) {
        mainQueue().async([completed = std::move(completed)] { completed(CommandBufferStatus::Error); });
        return;
    }
    backgroundQueue().async([frame = std::move(frame), completed = std::move(completed)]() mutable {
        const bool drawn = frame->wait();
        // What a hung device still holds is waited for here, not on the main thread.
        if (!drawn)
            frame.reset();
        mainQueue().async([frame = std::move(frame), completed = std::move(completed), drawn] {
            if (drawn)
                frame->deliver();
            completed(drawn ? CommandBufferStatus::Completed : CommandBufferStatus::Error);
        });
    });
}

} // namespace favrin::platform::gpu::vulkan
