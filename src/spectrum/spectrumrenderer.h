#pragma once

#include "platform/color/color.h"
#include "platform/gpu/systemdevice.h"
#include "platform/gpu/vexelview.h"
#include "spectrum/fieldcolor.h"

#include <QPointF>

namespace favrin::spectrum {

/**
 * Draws the field into a GPU view: one quad whose fragments compute their color. It asks for a redraw when the size of
 * the view's drawables changes and at no other time; a frame for which anything is missing is skipped. Main thread
 * only.
 */
class SpectrumRenderer : public platform::gpu::VexelViewDelegate
{
public:
    /** Sets everything up and becomes the view's delegate; the view must outlive it. */
    explicit SpectrumRenderer(platform::gpu::VexelView &vexelView,
                              std::shared_ptr<platform::gpu::Device> device = platform::gpu::systemDefaultDevice());
    ~SpectrumRenderer() override;
    SpectrumRenderer(const SpectrumRenderer &) = delete;
    SpectrumRenderer &operator=(const SpectrumRenderer &) = delete;

    /**
     * The color of a location (see FieldLocation): opaque, in extended sRGB. The location is narrowed to single
     * precision.
     */
    static platform::Color colorAtLocation(QPointF location);
    /** The location that shows a color, whose alpha is not looked at. */
    static QPointF positionForColor(const FieldColor &color);

    const std::shared_ptr<platform::gpu::CommandQueue> &commandQueue() const { return m_commandQueue; }
    void setCommandQueue(std::shared_ptr<platform::gpu::CommandQueue> queue) { m_commandQueue = std::move(queue); }
    const std::shared_ptr<platform::gpu::Device> &device() const { return m_device; }
    void setDevice(std::shared_ptr<platform::gpu::Device> device) { m_device = std::move(device); }
    /** Null when the pipeline could not be compiled. */
    const std::shared_ptr<platform::gpu::RenderPipelineState> &pipelineState() const { return m_pipelineState; }
    void setPipelineState(std::shared_ptr<platform::gpu::RenderPipelineState> state)
    {
        m_pipelineState = std::move(state);
    }
    const std::shared_ptr<platform::gpu::Buffer> &vertexBuffer() const { return m_vertexBuffer; }
    void setVertexBuffer(std::shared_ptr<platform::gpu::Buffer> buffer) { m_vertexBuffer = std::move(buffer); }
    platform::gpu::VexelView *vexelView() const { return m_vexelView; }
    void setVexelView(platform::gpu::VexelView *view) { m_vexelView = view; }

    /** Compiles the pipeline for the view's pixels and the color space in which the surface reads them. */
    void setupRenderPipeline();

    void draw(platform::gpu::VexelView &view) override;
    void drawableSizeWillChange(platform::gpu::VexelView &view, QSize size) override;

    /** For debugging: frames drawn from now on are written to a new folder, which is named in the log. */
    void startCapturing();
    void stopCapturing();

private:
    void initializeVertexBuffer();

    std::shared_ptr<platform::gpu::CommandQueue> m_commandQueue;
    std::shared_ptr<platform::gpu::Device> m_device;
    std::shared_ptr<platform::gpu::RenderPipelineState> m_pipelineState;
    std::shared_ptr<platform::gpu::Buffer> m_vertexBuffer;
    platform::gpu::VexelView *m_vexelView;
};

} // namespace favrin::spectrum
