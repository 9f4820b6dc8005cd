#pragma once

#include "platform/gpu/renderpass.h"

namespace favrin::platform::gpu {

/** Encodes one render pass into a command buffer. Made by it. */
class RenderCommandEncoder
{
public:
    /** Encodes into the pass at @p index of @p passes. */
    RenderCommandEncoder(std::vector<RenderPass> &passes, std::size_t index);

    void setRenderPipelineState(std::shared_ptr<RenderPipelineState> state);
    /** @param index the slot that the vertex function reads; there is one, 0, and others are not bound */
    void setVertexBuffer(std::shared_ptr<Buffer> buffer, std::size_t offset, std::uint32_t index);
    /** Draws with what is set. Without a pipeline state or a vertex buffer there is nothing to draw. */
    void drawPrimitives(PrimitiveType type, std::uint32_t vertexStart, std::uint32_t vertexCount);
    /** Ends the pass; what is encoded afterwards is dropped. */
    void endEncoding();

private:
    std::vector<RenderPass> &m_passes;
    std::size_t m_index;
    DrawCommand m_current;
    bool m_ended = false;
};

} // namespace favrin::platform::gpu
