#pragma once

#include "spectrum/spectrumrenderer.h"

namespace favrin::spectrum {

/** The field as an item: a GPU view with rounded corners that draws on demand, and the renderer that draws into it. */
class SpectrumView : public QQuickItem
{
    Q_OBJECT

public:
    explicit SpectrumView(QQuickItem *parent = nullptr);
    ~SpectrumView() override;

    /** Of the corners, in points. */
    static double cornerRadius();
    platform::gpu::VexelView &vexelView() { return *m_vexelView; }
    SpectrumRenderer &renderer() { return *m_coordinator.renderer; }

protected:
    void geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry) override;

private:
    /** Keeps the renderer for as long as the view shows. */
    struct Coordinator
    {
        std::unique_ptr<SpectrumRenderer> renderer;
    };

    void makeRenderer();
    void followSurface();

    platform::gpu::VexelView *m_vexelView;
    Coordinator m_coordinator;
};

} // namespace favrin::spectrum
