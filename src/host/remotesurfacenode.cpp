#include "host/remotesurfacenode.h"

#include "host/remotesurface.h"

#include <QQuickWindow>
#include <QSGImageNode>
#include <QSGRendererInterface>
#include <QSGTexture>

#include <algorithm>

namespace favrin::host {

namespace {

/** Pixels; small enough that a moved marker repaints little, large enough that a full repaint stays one of few parts.
 */
constexpr int stripHeight = 64;

QRect stripRectangle(const QSize &size, int index)
{
    const int top = index * stripHeight;
    return {0, top, size.width(), std::min(stripHeight, size.height() - top)};
}

} // namespace

RemoteSurfaceNode::RemoteSurfaceNode(QQuickWindow &window) : m_window(window) {}

RemoteSurfaceNode::~RemoteSurfaceNode() = default;

void RemoteSurfaceNode::rebuild(const QSize &size)
{
    for (auto *strip : m_strips) {
        removeChildNode(strip);
        delete strip;
    }
    m_strips.clear();
    m_size = size;
    for (int top = 0; top < size.height(); top += stripHeight) {
        auto *strip = m_window.createImageNode();
        strip->setOwnsTexture(false);
        appendChildNode(strip);
        m_strips.push_back(strip);
    }
}

void RemoteSurfaceNode::update(const RemoteSurface &surface, const QRectF &target, const QRegion &damage,
                               bool everything)
{
    const QSize size = surface.size();
    const bool rebuilt = size != m_size;
    if (rebuilt)
        rebuild(size);
    if (everything || !damage.isEmpty() || rebuilt) {
        // The software scene graph paints on this thread before the surface can change again, so it may use the
        // memory itself; a GPU uploads later, on its own thread.
        const bool software = m_window.rendererInterface()->graphicsApi() == QSGRendererInterface::Software;
        const QImage image = software ? surface.image() : surface.image().copy();
        auto previous = std::move(m_texture);
        m_texture.reset(m_window.createTextureFromImage(image, QQuickWindow::TextureHasAlphaChannel));
        for (auto *strip : m_strips)
            strip->setTexture(m_texture.get());
    }
    const bool moved = target != m_target;
    m_target = target;
    const double pointsPerPixel = size.height() > 0 ? target.height() / size.height() : 0.0;
    for (int index = 0; index < static_cast<int>(m_strips.size()); ++index) {
        const QRect source = stripRectangle(size, index);
        auto *strip = m_strips[static_cast<std::size_t>(index)];
        if (rebuilt || moved) {
            strip->setSourceRect(source);
            strip->setRect(target.x(), target.y() + source.y() * pointsPerPixel, target.width(),
                           source.height() * pointsPerPixel);
            const bool exact =
                qFuzzyCompare(target.width() * m_window.effectiveDevicePixelRatio(), double(size.width()));
            strip->setFiltering(exact ? QSGTexture::Nearest : QSGTexture::Linear);
        }
        if (everything || rebuilt || damage.intersects(source))
            strip->markDirty(DirtyMaterial);
    }
}

} // namespace favrin::host
