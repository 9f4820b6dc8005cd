#pragma once

#include "platform/gpu/commandqueue.h"
#include "platform/gpu/rendercommandencoder.h"

namespace favrin::platform::gpu {

class Drawable;

/** The commands of one frame. Made by a CommandQueue, filled by encoders, committed once. */
class CommandBuffer
{
public:
    explicit CommandBuffer(std::shared_ptr<Device> device);

    /** Starts a render pass. One encoder at a time; it must not outlive the command buffer. */
    std::unique_ptr<RenderCommandEncoder> makeRenderCommandEncoder(const RenderPassDescriptor &descriptor);
    /** Shows @p drawable when the commands have completed. */
    void present(std::shared_ptr<Drawable> drawable);
    /** Called on the main thread after the drawable was presented, or could not be. */
    void addCompletedHandler(CompletedHandler handler);
    /** Sends the commands to the device and waits for nothing. */
    void commit();

private:
    std::shared_ptr<Device> m_device;
    std::vector<RenderPass> m_passes;
    std::shared_ptr<Drawable> m_drawable;
    std::vector<CompletedHandler> m_handlers;
};

} // namespace favrin::platform::gpu
