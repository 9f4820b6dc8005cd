#pragma once

#include "platform/gpu/library.h"
#include "platform/gpu/vulkan/vulkancontext.h"

#include <QString>

namespace favrin::platform::gpu::vulkan {

/** A shader module with one entry point, and the constants to compile it with. */
class VulkanFunction : public Function
{
public:
    VulkanFunction(std::shared_ptr<VulkanContext> context, std::string name, vk::raii::ShaderModule module,
                   std::span<const std::uint32_t> constants);

    std::string name() const override { return m_name; }
    /** The function as a stage of a pipeline; valid while the function lives. */
    vk::PipelineShaderStageCreateInfo stage(vk::ShaderStageFlagBits stage) const;

private:
    std::shared_ptr<VulkanContext> m_context;
    std::string m_name;
    vk::raii::ShaderModule m_module;
    std::vector<std::uint32_t> m_constants;
    std::vector<vk::SpecializationMapEntry> m_entries;
    vk::SpecializationInfo m_specialization;
};

/** The SPIR-V modules in a folder. */
class VulkanLibrary : public Library
{
public:
    VulkanLibrary(std::shared_ptr<VulkanContext> context, QString folder);
    std::shared_ptr<Function> makeFunction(std::string_view name, std::span<const std::uint32_t> constants) override;

private:
    std::shared_ptr<VulkanContext> m_context;
    QString m_folder;
};

} // namespace favrin::platform::gpu::vulkan
