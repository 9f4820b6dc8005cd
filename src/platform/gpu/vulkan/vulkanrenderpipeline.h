#pragma once

#include "platform/gpu/renderpipeline.h"
#include "platform/gpu/vulkan/vulkanlibrary.h"

namespace favrin::platform::gpu::vulkan {

/** A compiled pipeline: triangles of one attribute, no blending, the viewport set with each draw. */
class VulkanRenderPipelineState : public RenderPipelineState
{
public:
    /** Throws when it cannot be compiled. */
    VulkanRenderPipelineState(std::shared_ptr<VulkanContext> context, const VulkanFunction &vertexFunction,
                              const VulkanFunction &fragmentFunction, const VertexDescriptor &vertexDescriptor);

    const vk::raii::Pipeline &pipeline() const { return m_pipeline; }

private:
    std::shared_ptr<VulkanContext> m_context;
    vk::raii::PipelineLayout m_layout;
    vk::raii::Pipeline m_pipeline;
};

} // namespace favrin::platform::gpu::vulkan
