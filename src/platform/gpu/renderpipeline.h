#pragma once

#include "platform/gpu/library.h"
#include "platform/gpu/pixelformat.h"

#include <array>

namespace favrin::platform::gpu {

/** How the vertices lie in the buffer at index 0: every one is so many floats, read as attribute 0. */
struct VertexDescriptor
{
    /** 1 to 4. */
    std::uint32_t floatsPerVertex = 0;

    std::uint32_t stride() const { return floatsPerVertex * static_cast<std::uint32_t>(sizeof(float)); }
};

struct RenderPipelineColorAttachmentDescriptor
{
    PixelFormat pixelFormat = PixelFormat::Invalid;
};

/** What a render pipeline is compiled from. */
struct RenderPipelineDescriptor
{
    std::shared_ptr<Function> vertexFunction;
    std::shared_ptr<Function> fragmentFunction;
    VertexDescriptor vertexDescriptor;
    std::array<RenderPipelineColorAttachmentDescriptor, 1> colorAttachments;
};

/** A compiled render pipeline. Made by a Device. */
class RenderPipelineState
{
public:
    virtual ~RenderPipelineState() = default;
};

} // namespace favrin::platform::gpu
