#pragma once

#include "platform/gpu/cpu/cpufunctions.h"
#include "platform/gpu/renderpass.h"

namespace favrin::platform::gpu::cpu {

// What the processor's device makes, as that device itself sees it.

class CpuBuffer : public Buffer
{
public:
    explicit CpuBuffer(std::span<const std::byte> bytes) : m_bytes(bytes.begin(), bytes.end()) {}
    std::size_t length() const override { return m_bytes.size(); }
    std::span<const std::byte> bytes() const { return m_bytes; }

private:
    std::vector<std::byte> m_bytes;
};

class CpuTexture : public Texture
{
public:
    CpuTexture(QSize size, PixelFormat format) : m_size(size), m_format(format) {}
    QSize size() const override { return m_size; }
    PixelFormat pixelFormat() const override { return m_format; }
    QImage takeImage() override { return std::exchange(m_image, {}); }
    /** The picture to draw into, made when it is first asked for; null when there is no memory. */
    QImage &image();

private:
    QSize m_size;
    PixelFormat m_format;
    QImage m_image;
};

class CpuFunction : public Function
{
public:
    explicit CpuFunction(CpuVertexFunction function) : m_name(function.name), m_vertex(function.shade) {}
    CpuFunction(CpuFragmentFunction function, std::span<const std::uint32_t> constants)
        : m_name(function.name), m_fragment(function.shade), m_constants(constants.begin(), constants.end())
    {
    }
    std::string name() const override { return m_name; }
    bool isVertexFunction() const { return m_vertex != nullptr; }
    ShadedVertex shade(const float *attribute) const { return m_vertex(attribute); }
    void shade(const FragmentBlock &block) const { m_fragment(block, m_constants); }

private:
    std::string m_name;
    decltype(CpuVertexFunction::shade) m_vertex = nullptr;
    decltype(CpuFragmentFunction::shade) m_fragment = nullptr;
    std::vector<std::uint32_t> m_constants;
};

/** Looks functions up among those that the program ships. */
class CpuLibrary : public Library
{
public:
    std::shared_ptr<Function> makeFunction(std::string_view name, std::span<const std::uint32_t> constants) override;
};

struct CpuRenderPipelineState : RenderPipelineState
{
    std::shared_ptr<CpuFunction> vertexFunction;
    std::shared_ptr<CpuFunction> fragmentFunction;
    VertexDescriptor vertexDescriptor;
};

} // namespace favrin::platform::gpu::cpu
