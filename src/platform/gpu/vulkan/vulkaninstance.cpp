#include "platform/gpu/vulkan/vulkaninstance.h"

#include <algorithm>

namespace favrin::platform::gpu::vulkan {
namespace {

int rank(vk::PhysicalDeviceType type, DeviceChoice choice)
{
    switch (type) {
    case vk::PhysicalDeviceType::eDiscreteGpu:
        return 4;
    case vk::PhysicalDeviceType::eIntegratedGpu:
        return 3;
    case vk::PhysicalDeviceType::eVirtualGpu:
        return 2;
    default:
        return choice == DeviceChoice::AnyDevice ? 1 : 0;
    }
}

VkBool32 passMessageOn(VkDebugUtilsMessageSeverityFlagBitsEXT, VkDebugUtilsMessageTypeFlagsEXT,
                       const VkDebugUtilsMessengerCallbackDataEXT *message, void *options)
{
    static_cast<const VulkanOptions *>(options)->messageHandler(message->pMessage);
    return VK_FALSE;
}

} // namespace

std::optional<std::size_t> preferredDevice(std::span<const vk::PhysicalDeviceType> types, DeviceChoice choice)
{
    const auto best = std::ranges::max_element(types, {}, [choice](auto type) { return rank(type, choice); });
    if (best == types.end() || rank(*best, choice) == 0)
        return std::nullopt;
    return static_cast<std::size_t>(best - types.begin());
}

VulkanInstance::VulkanInstance(VulkanOptions options) : m_options(std::move(options)), m_instance(makeInstance())
{
    if (m_options.messageHandler)
        listen();
    m_physicalDevices = m_instance.enumeratePhysicalDevices();
    std::vector<vk::PhysicalDeviceType> types;
    for (const auto &device : m_physicalDevices)
        types.push_back(device.getProperties().deviceType);
    m_chosen = preferredDevice(types, m_options.choice);
}

vk::raii::Instance VulkanInstance::makeInstance() const
{
    vk::ApplicationInfo application;
    application.apiVersion = VK_API_VERSION_1_1;
    std::vector<const char *> layers;
    for (const std::string &layer : m_options.layers)
        layers.push_back(layer.c_str());
    std::vector<const char *> extensions;
    if (m_options.messageHandler)
        extensions.push_back(VK_EXT_DEBUG_UTILS_EXTENSION_NAME);
    vk::InstanceCreateInfo info;
    info.pApplicationInfo = &application;
    info.setPEnabledLayerNames(layers);
    info.setPEnabledExtensionNames(extensions);
    return m_context.createInstance(info);
}

void VulkanInstance::listen()
{
    // By the C structure: the type of its callback differs between versions of the C++ headers.
    VkDebugUtilsMessengerCreateInfoEXT info = {};
    info.sType = VK_STRUCTURE_TYPE_DEBUG_UTILS_MESSENGER_CREATE_INFO_EXT;
    info.messageSeverity =
        VK_DEBUG_UTILS_MESSAGE_SEVERITY_WARNING_BIT_EXT | VK_DEBUG_UTILS_MESSAGE_SEVERITY_ERROR_BIT_EXT;
    info.messageType = VK_DEBUG_UTILS_MESSAGE_TYPE_VALIDATION_BIT_EXT |
                       VK_DEBUG_UTILS_MESSAGE_TYPE_PERFORMANCE_BIT_EXT | VK_DEBUG_UTILS_MESSAGE_TYPE_GENERAL_BIT_EXT;
    info.pfnUserCallback = passMessageOn;
    info.pUserData = &m_options;
    m_messenger = m_instance.createDebugUtilsMessengerEXT(vk::DebugUtilsMessengerCreateInfoEXT(info));
}

const vk::raii::PhysicalDevice *VulkanInstance::physicalDevice() const
{
    return m_chosen ? &m_physicalDevices[*m_chosen] : nullptr;
}

} // namespace favrin::platform::gpu::vulkan
