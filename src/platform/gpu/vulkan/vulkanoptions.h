#pragma once

#include <functional>
#include <string>
#include <vector>

namespace favrin::platform::gpu::vulkan {

/** Which Vulkan devices are acceptable. */
enum class DeviceChoice {
    HardwareOnly,
    /** Drivers that draw by the processor too, where there is no hardware. */
    AnyDevice
};

/** How the Vulkan device is made. */
struct VulkanOptions
{
    DeviceChoice choice = DeviceChoice::HardwareOnly;
    /** Instance layers to load, such as the validation layer. One that is not installed makes no device. */
    std::vector<std::string> layers;
    /** Takes every message of layers and driver; called on any thread. */
    std::function<void(const std::string &)> messageHandler;
};

} // namespace favrin::platform::gpu::vulkan
