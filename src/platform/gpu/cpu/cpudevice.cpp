#include "platform/gpu/cpu/cpudevice.h"

#include "platform/gpu/cpu/cpuobjects.h"
#include "platform/gpu/cpu/rasterrectangle.h"
#include "platform/gpu/gpulog.h"

#include <QColor>

#include <array>
#include <cstring>

namespace favrin::platform::gpu::cpu {
namespace {

constexpr std::size_t verticesPerRectangle = 6;

/** The vertices of one rectangle, shaded; none when the buffer ends before them. */
std::optional<std::array<ShadedVertex, verticesPerRectangle>> shadedVertices(const DrawCommand &draw, std::size_t first)
{
    const auto &pipeline = static_cast<const CpuRenderPipelineState &>(*draw.pipelineState);
    const auto bytes = static_cast<const CpuBuffer &>(*draw.vertexBuffer).bytes();
    const std::size_t stride = pipeline.vertexDescriptor.stride();
    const std::size_t begin = draw.vertexBufferOffset + first * stride;
    if (begin + verticesPerRectangle * stride > bytes.size())
        return std::nullopt;
    std::array<ShadedVertex, verticesPerRectangle> vertices;
    for (std::size_t i = 0; i < vertices.size(); ++i) {
        std::array<float, 4> attribute = {};
        std::memcpy(attribute.data(), bytes.data() + begin + i * stride, stride);
        vertices[i] = pipeline.vertexFunction->shade(attribute.data());
    }
    return vertices;
}

std::vector<RasterRectangle> rectangles(const DrawCommand &draw, QSize size)
{
    std::vector<RasterRectangle> result;
    for (std::size_t offset = 0; offset + verticesPerRectangle <= draw.vertexCount; offset += verticesPerRectangle) {
        const auto vertices = shadedVertices(draw, draw.vertexStart + offset);
        auto rectangle = vertices ? rasterRectangle(*vertices, size) : std::nullopt;
        if (rectangle)
            result.push_back(std::move(*rectangle));
        else
            gpuLog().warning("The processor draws upright rectangles only; two triangles are left out");
    }
    return result;
}

void draw(const CpuFunction &fragmentFunction, const RasterRectangle &rectangle, QImage &image)
{
    if (rectangle.pixels.isEmpty())
        return;
    const QPoint origin = rectangle.pixels.topLeft();
    fragmentFunction.shade(FragmentBlock{
        .columns = rectangle.columns,
        .rows = rectangle.rows,
        .pixels = reinterpret_cast<std::uint32_t *>(image.scanLine(origin.y())) + origin.x(),
        .rowStride = image.bytesPerLine() / static_cast<qsizetype>(sizeof(std::uint32_t)),
    });
}

QColor color(const ClearColor &clear)
{
    return QColor::fromRgbF(static_cast<float>(clear.red), static_cast<float>(clear.green),
                            static_cast<float>(clear.blue), static_cast<float>(clear.alpha));
}

bool run(const RenderPass &pass)
{
    const auto &attachment = pass.descriptor.colorAttachments[0];
    QImage &image = static_cast<CpuTexture &>(*attachment.texture).image();
    if (image.isNull())
        return false;
    bool cleared = false;
    for (const DrawCommand &command : pass.draws) {
        const auto &pipeline = static_cast<const CpuRenderPipelineState &>(*command.pipelineState);
        for (const RasterRectangle &rectangle : rectangles(command, image.size())) {
            // What is drawn over entirely need not be cleared.
            if (!cleared && rectangle.pixels != image.rect())
                image.fill(color(attachment.clearColor));
            cleared = true;
            draw(*pipeline.fragmentFunction, rectangle, image);
        }
    }
    if (!cleared)
        image.fill(color(attachment.clearColor));
    return true;
}

} // namespace

std::string CpuDevice::name() const
{
    return "processor";
}

std::shared_ptr<Buffer> CpuDevice::makeBuffer(std::span<const std::byte> bytes)
{
    return std::make_shared<CpuBuffer>(bytes);
}

std::shared_ptr<Library> CpuDevice::makeDefaultLibrary()
{
    return std::make_shared<CpuLibrary>();
}

std::shared_ptr<Texture> CpuDevice::makeTexture(QSize size, PixelFormat format)
{
    if (size.isEmpty() || format == PixelFormat::Invalid)
        return nullptr;
    return std::make_shared<CpuTexture>(size, format);
}

std::shared_ptr<RenderPipelineState> CpuDevice::makeRenderPipelineState(const RenderPipelineDescriptor &descriptor,
                                                                        std::string *error)
{
    auto state = std::make_shared<CpuRenderPipelineState>();
    state->vertexFunction = std::dynamic_pointer_cast<CpuFunction>(descriptor.vertexFunction);
    state->fragmentFunction = std::dynamic_pointer_cast<CpuFunction>(descriptor.fragmentFunction);
    state->vertexDescriptor = descriptor.vertexDescriptor;
    const bool hasFunctions = state->vertexFunction && state->vertexFunction->isVertexFunction() &&
                              state->fragmentFunction && !state->fragmentFunction->isVertexFunction();
    const auto floats = descriptor.vertexDescriptor.floatsPerVertex;
    if (hasFunctions && floats >= 1 && floats <= 4 &&
        descriptor.colorAttachments[0].pixelFormat != PixelFormat::Invalid)
        return state;
    if (error)
        *error = hasFunctions ? "the vertices or the pixels have no format" : "a shader function is missing";
    return nullptr;
}

void CpuDevice::submit(std::vector<RenderPass> passes, CompletedHandler completed)
{
    bool drawn = true;
    for (const RenderPass &pass : passes)
        drawn = pass.descriptor.colorAttachments[0].texture && run(pass) && drawn;
    completed(drawn ? CommandBufferStatus::Completed : CommandBufferStatus::Error);
}

} // namespace favrin::platform::gpu::cpu
