#pragma once

#include "platform/gpu/device.h"
#include "platform/gpu/vulkan/vulkanoptions.h"

namespace favrin::platform::gpu::vulkan {

class VulkanContext;

/**
 * A GPU, by Vulkan 1.1, without any window system: it draws into images of its own and copies them to the host. A
 * frame that fails, as all do once the device is lost, completes with an error.
 *
 * Frames are recorded and sent on the main thread; waiting for them and copying them out is done on the background
 * queue.
 */
class VulkanDevice : public Device
{
public:
    /**
     * A device, or null where there is no acceptable one; @p reason says why. Takes tens of milliseconds: drivers are
     * loaded. Any thread.
     */
    static std::shared_ptr<VulkanDevice> create(VulkanOptions options, std::string *reason);

    explicit VulkanDevice(std::shared_ptr<VulkanContext> context);
    ~VulkanDevice() override;

    std::string name() const override;
    Kind kind() const override;
    std::shared_ptr<Buffer> makeBuffer(std::span<const std::byte> bytes) override;
    std::shared_ptr<Library> makeDefaultLibrary() override;
    std::shared_ptr<Texture> makeTexture(QSize size, PixelFormat format) override;
    std::shared_ptr<RenderPipelineState> makeRenderPipelineState(const RenderPipelineDescriptor &descriptor,
                                                                 std::string *error) override;
    void submit(std::vector<RenderPass> passes, CompletedHandler completed) override;

private:
    std::shared_ptr<VulkanContext> m_context;
};

} // namespace favrin::platform::gpu::vulkan
