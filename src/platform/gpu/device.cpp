#include "platform/gpu/device.h"

namespace favrin::platform::gpu {

std::shared_ptr<CommandQueue> Device::makeCommandQueue()
{
    return std::make_shared<CommandQueue>(shared_from_this());
}

} // namespace favrin::platform::gpu
