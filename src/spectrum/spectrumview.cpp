#include "spectrum/spectrumview.h"

#include "service/displaycolor.h"

namespace favrin::spectrum {

using platform::gpu::SystemDevice;
using platform::gpu::VexelView;
using service::DisplayColor;

SpectrumView::SpectrumView(QQuickItem *parent) : QQuickItem(parent), m_vexelView(new VexelView(this))
{
    m_vexelView->setOpaque(true);
    m_vexelView->setPaused(true);
    m_vexelView->setEnableSetNeedsDisplay(true);
    m_vexelView->setCornerRadius(cornerRadius());
    makeRenderer();
    connect(&SystemDevice::instance(), &SystemDevice::deviceChanged, this, &SpectrumView::makeRenderer);
    connect(&DisplayColor::instance(), &DisplayColor::surfaceColorSpaceChanged, this, &SpectrumView::followSurface);
}

SpectrumView::~SpectrumView() = default;

double SpectrumView::cornerRadius()
{
    return 8.0;
}

void SpectrumView::geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChange(newGeometry, oldGeometry);
    m_vexelView->setSize(newGeometry.size());
}

void SpectrumView::makeRenderer()
{
    m_coordinator.renderer = std::make_unique<SpectrumRenderer>(*m_vexelView);
}

void SpectrumView::followSurface()
{
    m_coordinator.renderer->setupRenderPipeline();
    m_vexelView->setNeedsDisplay();
}

} // namespace favrin::spectrum
