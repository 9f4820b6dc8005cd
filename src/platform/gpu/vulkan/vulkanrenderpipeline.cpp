#include "platform/gpu/vulkan/vulkanrenderpipeline.h"

#include <array>

namespace favrin::platform::gpu::vulkan {
namespace {

vk::Format attributeFormat(std::uint32_t floats)
{
    constexpr std::array formats = {vk::Format::eUndefined, vk::Format::eR32Sfloat, vk::Format::eR32G32Sfloat,
                                    vk::Format::eR32G32B32Sfloat, vk::Format::eR32G32B32A32Sfloat};
    return floats < formats.size() ? formats[floats] : vk::Format::eUndefined;
}

vk::raii::PipelineLayout makeLayout(const VulkanContext &context)
{
    return context.device().createPipelineLayout(vk::PipelineLayoutCreateInfo());
}

vk::raii::Pipeline makePipeline(const VulkanContext &context, const vk::raii::PipelineLayout &layout,
                                std::array<vk::PipelineShaderStageCreateInfo, 2> stages,
                                const VertexDescriptor &vertexDescriptor)
{
    vk::VertexInputBindingDescription binding;
    binding.stride = vertexDescriptor.stride();
    binding.inputRate = vk::VertexInputRate::eVertex;
    vk::VertexInputAttributeDescription attribute;
    attribute.format = attributeFormat(vertexDescriptor.floatsPerVertex);
    vk::PipelineVertexInputStateCreateInfo vertexInput;
    vertexInput.setVertexBindingDescriptions(binding);
    vertexInput.setVertexAttributeDescriptions(attribute);

    vk::PipelineInputAssemblyStateCreateInfo assembly;
    assembly.topology = vk::PrimitiveTopology::eTriangleList;
    vk::PipelineViewportStateCreateInfo viewport;
    viewport.viewportCount = 1;
    viewport.scissorCount = 1;
    vk::PipelineRasterizationStateCreateInfo rasterization;
    rasterization.polygonMode = vk::PolygonMode::eFill;
    rasterization.cullMode = vk::CullModeFlagBits::eNone;
    rasterization.lineWidth = 1.0F;
    vk::PipelineMultisampleStateCreateInfo multisample;
    multisample.rasterizationSamples = vk::SampleCountFlagBits::e1;
    vk::PipelineColorBlendAttachmentState attachment;
    attachment.colorWriteMask = vk::ColorComponentFlagBits::eR | vk::ColorComponentFlagBits::eG |
                                vk::ColorComponentFlagBits::eB | vk::ColorComponentFlagBits::eA;
    vk::PipelineColorBlendStateCreateInfo blending;
    blending.setAttachments(attachment);
    constexpr std::array dynamicStates = {vk::DynamicState::eViewport, vk::DynamicState::eScissor};
    vk::PipelineDynamicStateCreateInfo dynamic;
    dynamic.setDynamicStates(dynamicStates);

    vk::GraphicsPipelineCreateInfo info;
    info.setStages(stages);
    info.pVertexInputState = &vertexInput;
    info.pInputAssemblyState = &assembly;
    info.pViewportState = &viewport;
    info.pRasterizationState = &rasterization;
    info.pMultisampleState = &multisample;
    info.pColorBlendState = &blending;
    info.pDynamicState = &dynamic;
    info.layout = *layout;
    info.renderPass = *context.renderPass();
    return context.device().createGraphicsPipeline(nullptr, info);
}

} // namespace

VulkanRenderPipelineState::VulkanRenderPipelineState(std::shared_ptr<VulkanContext> context,
                                                     const VulkanFunction &vertexFunction,
                                                     const VulkanFunction &fragmentFunction,
                                                     const VertexDescriptor &vertexDescriptor)
    : m_context(std::move(context))
    , m_layout(makeLayout(*m_context))
    , m_pipeline(makePipeline(*m_context, m_layout,
                              {vertexFunction.stage(vk::ShaderStageFlagBits::eVertex),
                               fragmentFunction.stage(vk::ShaderStageFlagBits::eFragment)},
                              vertexDescriptor))
{
}

} // namespace favrin::platform::gpu::vulkan
