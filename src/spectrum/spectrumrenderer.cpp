#include "spectrum/spectrumrenderer.h"

#include "platform/gpu/capturemanager.h"
#include "platform/gpu/commandbuffer.h"
#include "service/colorpickerlog.h"
#include "service/displaycolor.h"
#include "spectrum/spectrummapping.h"
#include "spectrum/spectrumshaders.h"

#include <QDir>
#include <QTemporaryDir>

namespace favrin::spectrum {

using namespace platform::gpu;

namespace {

struct Vertex
{
    float x;
    float y;
};

/** Two triangles that cover the viewport. */
constexpr std::array<Vertex, 6> quad = {
    {{-1.0F, 1.0F}, {-1.0F, -1.0F}, {1.0F, -1.0F}, {-1.0F, 1.0F}, {1.0F, 1.0F}, {1.0F, -1.0F}}};

/** A GPU that failed draws no more: the system goes back to the processor, and whoever draws is told. */
void leaveFailedDevice(const std::shared_ptr<Device> &device, CommandBufferStatus status)
{
    if (status == CommandBufferStatus::Error)
        SystemDevice::instance().abandon(device);
}

} // namespace

SpectrumRenderer::SpectrumRenderer(VexelView &vexelView, std::shared_ptr<Device> device)
    : m_device(std::move(device)), m_vexelView(&vexelView)
{
    if (m_device)
        m_commandQueue = m_device->makeCommandQueue();
    m_vexelView->setDevice(m_device);
    m_vexelView->setDelegate(this);
    initializeVertexBuffer();
    setupRenderPipeline();
}

SpectrumRenderer::~SpectrumRenderer()
{
    if (m_vexelView && m_vexelView->delegate() == this)
        m_vexelView->setDelegate(nullptr);
}

platform::Color SpectrumRenderer::colorAtLocation(QPointF location)
{
    const FieldColor color = fieldColor({static_cast<float>(location.x()), static_cast<float>(location.y())});
    const platform::Triple components = {color.r, color.g, color.b};
    return platform::Color(platform::ColorSpace::extendedSRGB(), components, color.a);
}

QPointF SpectrumRenderer::positionForColor(const FieldColor &color)
{
    const FieldLocation location = fieldLocation(color);
    return {location.x, location.y};
}

void SpectrumRenderer::initializeVertexBuffer()
{
    if (m_device)
        m_vertexBuffer = m_device->makeBuffer(std::as_bytes(std::span(quad)));
}

void SpectrumRenderer::setupRenderPipeline()
{
    m_pipelineState.reset();
    if (!m_device)
        return;
    installSpectrumShaders();
    const auto library = m_device->makeDefaultLibrary();
    const std::array<std::uint32_t, 1> constants = {
        surfaceColorSpaceConstant(service::DisplayColor::instance().surfaceColorSpace())};
    RenderPipelineDescriptor descriptor;
    descriptor.vertexFunction = library->makeFunction("vertexShader");
    descriptor.fragmentFunction = library->makeFunction("fragmentShader", constants);
    descriptor.vertexDescriptor.floatsPerVertex = sizeof(Vertex) / sizeof(float);
    descriptor.colorAttachments[0].pixelFormat = m_vexelView->colorPixelFormat();
    m_pipelineState = m_device->makeRenderPipelineState(descriptor, nullptr);
}

void SpectrumRenderer::draw(VexelView &)
{
    if (!m_commandQueue || !m_pipelineState || !m_vertexBuffer)
        return;
    const auto commandBuffer = m_commandQueue->makeCommandBuffer();
    auto descriptor = m_vexelView->currentRenderPassDescriptor();
    if (!descriptor)
        return;
    descriptor->colorAttachments[0].clearColor = {0.0, 0.0, 0.0, 0.0};
    const auto encoder = commandBuffer->makeRenderCommandEncoder(*descriptor);
    encoder->setRenderPipelineState(m_pipelineState);
    encoder->setVertexBuffer(m_vertexBuffer, 0, 0);
    encoder->drawPrimitives(PrimitiveType::Triangle, 0, quad.size());
    encoder->endEncoding();
    commandBuffer->present(m_vexelView->currentDrawable());
    commandBuffer->addCompletedHandler(
        [device = m_device](CommandBufferStatus status) { leaveFailedDevice(device, status); });
    commandBuffer->commit();
}

void SpectrumRenderer::drawableSizeWillChange(VexelView &view, QSize)
{
    view.setNeedsDisplay();
}

void SpectrumRenderer::startCapturing()
{
    QTemporaryDir folder(QDir::tempPath() + QStringLiteral("/spectrum-capture-XXXXXX"));
    folder.setAutoRemove(false);
    if (CaptureManager::shared().startCapture({m_device, folder.path()}))
        service::colorPickerLog().warning("Frames of the spectrum are captured to " + folder.path().toStdString());
}

void SpectrumRenderer::stopCapturing()
{
    CaptureManager::shared().stopCapture();
}

} // namespace favrin::spectrum
