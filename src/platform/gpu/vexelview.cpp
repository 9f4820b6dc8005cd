#include "platform/gpu/vexelview.h"

#include "platform/gpu/device.h"
#include "platform/shapes/continuousroundedrect.h"

#include <QPainter>
#include <QPointer>
#include <QQuickWindow>

#include <algorithm>

namespace favrin::platform::gpu {
namespace {

/** No surface is larger. */
constexpr int largestDrawableExtent = 8192;

void cutCornersOff(QImage &image, double radius)
{
    QPainterPath outside;
    outside.addRect(QRectF(image.rect()));
    outside.addPath(continuousRoundedRect(QRectF(image.rect()), radius));
    outside.setFillRule(Qt::OddEvenFill);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setCompositionMode(QPainter::CompositionMode_DestinationOut);
    painter.fillPath(outside, Qt::black);
}

} // namespace

VexelView::VexelView(QQuickItem *parent) : CrispPaintedItem(parent) {}

void VexelView::setDevice(std::shared_ptr<Device> device)
{
    m_drawable.reset();
    m_device = std::move(device);
}

void VexelView::setDelegate(VexelViewDelegate *delegate)
{
    m_delegate = delegate;
    if (delegate && !m_drawableSize.isEmpty())
        setNeedsDisplay();
}

void VexelView::setPaused(bool paused)
{
    m_paused = paused;
    polish();
}

std::optional<RenderPassDescriptor> VexelView::currentRenderPassDescriptor()
{
    const auto drawable = currentDrawable();
    if (!drawable)
        return std::nullopt;
    RenderPassDescriptor descriptor;
    descriptor.colorAttachments[0].texture = drawable->texture();
    return descriptor;
}

std::shared_ptr<Drawable> VexelView::currentDrawable()
{
    const bool drawable = m_device && !m_drawableSize.isEmpty() &&
                          std::max(m_drawableSize.width(), m_drawableSize.height()) <= largestDrawableExtent;
    if (!m_drawable && drawable) {
        if (auto texture = m_device->makeTexture(m_drawableSize, colorPixelFormat())) {
            m_drawable = std::make_shared<Drawable>(std::move(texture), [view = QPointer(this)](const QImage &image) {
                if (view)
                    view->present(image);
            });
        }
    }
    return m_drawable;
}

void VexelView::setNeedsDisplay()
{
    if (!m_enableSetNeedsDisplay)
        return;
    m_needsDisplay = true;
    polish();
}

void VexelView::draw()
{
    m_needsDisplay = false;
    if (!m_delegate || m_drawableSize.isEmpty())
        return;
    m_delegate->draw(*this);
    m_drawable.reset();
}

void VexelView::present(QImage image)
{
    // A frame of an earlier size arrives late: the one of this size follows.
    if (image.size() != m_drawableSize)
        return;
    if (m_cornerRadius > 0.0 && window())
        cutCornersOff(image, m_cornerRadius * window()->effectiveDevicePixelRatio());
    else if (m_opaque)
        image.reinterpretAsFormat(QImage::Format_RGB32);
    m_picture = std::move(image);
    repaint();
}

QImage VexelView::render(double)
{
    return m_picture;
}

void VexelView::paint(QPainter &painter, QSize, double)
{
    painter.drawImage(0, 0, m_picture);
}

void VexelView::updatePolish()
{
    const QSize size = window() ? pixelSize(window()->effectiveDevicePixelRatio()) : QSize();
    if (size != m_drawableSize) {
        m_drawableSize = size;
        if (m_delegate)
            m_delegate->drawableSizeWillChange(*this, size);
    }
    if (m_needsDisplay || !m_paused)
        draw();
    if (!m_paused)
        drawForEveryFrame();
}

void VexelView::drawForEveryFrame()
{
    if (!window())
        return;
    connect(window(), &QQuickWindow::frameSwapped, this, &QQuickItem::polish, Qt::SingleShotConnection);
    update();
}

void VexelView::geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    CrispPaintedItem::geometryChange(newGeometry, oldGeometry);
    if (newGeometry.size() != oldGeometry.size())
        polish();
}

void VexelView::itemChange(ItemChange change, const ItemChangeData &value)
{
    CrispPaintedItem::itemChange(change, value);
    if (change == ItemDevicePixelRatioHasChanged || change == ItemSceneChange)
        polish();
}

} // namespace favrin::platform::gpu
