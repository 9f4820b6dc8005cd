#pragma once

#include "platform/gpu/vulkan/vulkanheaders.h"
#include "platform/gpu/vulkan/vulkanoptions.h"

#include <optional>
#include <span>

namespace favrin::platform::gpu::vulkan {

/**
 * The index of the physical device to use: hardware of its own before hardware in the processor before virtual
 * hardware, the first of equals; a device that is the processor only where any will do. None when none is acceptable.
 */
std::optional<std::size_t> preferredDevice(std::span<const vk::PhysicalDeviceType> types, DeviceChoice choice);

/** The loader, an instance of the interface and the physical device chosen. */
class VulkanInstance
{
public:
    /** Throws a vk::SystemError or std::runtime_error where there is no loader, driver or layer. */
    explicit VulkanInstance(VulkanOptions options);
    VulkanInstance(const VulkanInstance &) = delete;
    VulkanInstance &operator=(const VulkanInstance &) = delete;

    /** Null when no device is acceptable. */
    const vk::raii::PhysicalDevice *physicalDevice() const;

private:
    vk::raii::Instance makeInstance() const;
    void listen();

    VulkanOptions m_options;
    vk::raii::Context m_context;
    vk::raii::Instance m_instance;
    std::optional<vk::raii::DebugUtilsMessengerEXT> m_messenger;
    std::vector<vk::raii::PhysicalDevice> m_physicalDevices;
    std::optional<std::size_t> m_chosen;
};

} // namespace favrin::platform::gpu::vulkan
