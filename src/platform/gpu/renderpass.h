#pragma once

#include "platform/gpu/buffer.h"
#include "platform/gpu/renderpipeline.h"
#include "platform/gpu/texture.h"

#include <cstdint>
#include <vector>

namespace favrin::platform::gpu {

/** Transparent black at first. */
struct ClearColor
{
    double red = 0.0;
    double green = 0.0;
    double blue = 0.0;
    double alpha = 0.0;
};

struct RenderPassColorAttachmentDescriptor
{
    std::shared_ptr<Texture> texture;
    ClearColor clearColor;
};

/** What a render pass draws into; each attachment is cleared first and stored at the end. */
struct RenderPassDescriptor
{
    std::array<RenderPassColorAttachmentDescriptor, 1> colorAttachments;
};

enum class PrimitiveType { Triangle };

/** One draw, with all that was set when it was encoded. */
struct DrawCommand
{
    std::shared_ptr<RenderPipelineState> pipelineState;
    std::shared_ptr<Buffer> vertexBuffer;
    std::size_t vertexBufferOffset = 0;
    PrimitiveType primitiveType = PrimitiveType::Triangle;
    std::uint32_t vertexStart = 0;
    std::uint32_t vertexCount = 0;
};

/** A render pass as it was encoded. */
struct RenderPass
{
    RenderPassDescriptor descriptor;
    std::vector<DrawCommand> draws;
};

} // namespace favrin::platform::gpu
