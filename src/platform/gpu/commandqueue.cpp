#include "platform/gpu/commandqueue.h"

#include "platform/gpu/commandbuffer.h"

namespace favrin::platform::gpu {

CommandQueue::CommandQueue(std::shared_ptr<Device> device) : m_device(std::move(device)) {}

std::unique_ptr<CommandBuffer> CommandQueue::makeCommandBuffer()
{
    return std::make_unique<CommandBuffer>(m_device);
}

} // namespace favrin::platform::gpu
