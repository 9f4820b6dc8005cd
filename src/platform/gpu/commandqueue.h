#pragma once

#include <functional>
#include <memory>

namespace favrin::platform::gpu {

class CommandBuffer;
class Device;

enum class CommandBufferStatus {
    Completed,
    /** Nothing was drawn; the device may be lost for good. */
    Error
};
using CompletedHandler = std::function<void(CommandBufferStatus)>;

/** Hands command buffers to a device in the order in which they are committed. */
class CommandQueue
{
public:
    explicit CommandQueue(std::shared_ptr<Device> device);

    const std::shared_ptr<Device> &device() const { return m_device; }
    std::unique_ptr<CommandBuffer> makeCommandBuffer();

private:
    std::shared_ptr<Device> m_device;
};

} // namespace favrin::platform::gpu
