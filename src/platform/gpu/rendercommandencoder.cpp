#include "platform/gpu/rendercommandencoder.h"

namespace favrin::platform::gpu {

RenderCommandEncoder::RenderCommandEncoder(std::vector<RenderPass> &passes, std::size_t index)
    : m_passes(passes), m_index(index)
{
}

void RenderCommandEncoder::setRenderPipelineState(std::shared_ptr<RenderPipelineState> state)
{
    m_current.pipelineState = std::move(state);
}

void RenderCommandEncoder::setVertexBuffer(std::shared_ptr<Buffer> buffer, std::size_t offset, std::uint32_t index)
{
    if (index != 0)
        return;
    m_current.vertexBuffer = std::move(buffer);
    m_current.vertexBufferOffset = offset;
}

void RenderCommandEncoder::drawPrimitives(PrimitiveType type, std::uint32_t vertexStart, std::uint32_t vertexCount)
{
    if (m_ended || !m_current.pipelineState || !m_current.vertexBuffer)
        return;
    DrawCommand draw = m_current;
    draw.primitiveType = type;
    draw.vertexStart = vertexStart;
    draw.vertexCount = vertexCount;
    m_passes[m_index].draws.push_back(std::move(draw));
}

void RenderCommandEncoder::endEncoding()
{
    m_ended = true;
}

} // namespace favrin::platform::gpu
