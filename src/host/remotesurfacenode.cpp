#include "host/remotesurfacenode.h"

#include "host/session/remotesurface.h"

#include <QQuickWindow>
#include <QSGImageNode>
#include <QSGRendererInterface>
#include <QSGTexture>

#include <algorithm>
#include <utility>

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

void RemoteSurfaceNode::clear()
{
    for (auto *strip : m_strips) {
        removeChildNode(strip);
        delete strip;
    }
    m_strips.clear();
}

void RemoteSurfaceNode::replaceTexture(const RemoteSurface &surface)
{
    // The software scene graph paints on this thread before the surface can change again, so it may use the memory
    // itself; a GPU uploads later, on its own thread.
    const bool software = m_window.rendererInterface()->graphicsApi() == QSGRendererInterface::Software;
    const QImage image = software ? surface.image() : surface.image().copy();
    const auto previous = std::exchange(m_texture, std::unique_ptr<QSGTexture>(m_window.createTextureFromImage(
                                                       image, QQuickWindow::TextureHasAlphaChannel)));
    for (auto *strip : m_strips)
        strip->setTexture(m_texture.get());
}

void RemoteSurfaceNode::build()
{
    for (int index = 0; index * stripHeight < m_size.height(); ++index) {
        auto *strip = m_window.createImageNode();
        strip->setOwnsTexture(false);
        strip->setTexture(m_texture.get());
        place(*strip, index);
        // Only now: the software scene graph looks at a node as soon as it is added.
        appendChildNode(strip);
        m_strips.push_back(strip);
    }
}

void RemoteSurfaceNode::place(QSGImageNode &strip, int index) const
{
    const QRect source = stripRectangle(m_size, index);
    const double pointsPerPixel = m_target.height() / m_size.height();
    strip.setSourceRect(source);
    strip.setRect(m_target.x(), m_target.y() + source.y() * pointsPerPixel, m_target.width(),
                  source.height() * pointsPerPixel);
    const double pixels = m_target.width() * m_window.effectiveDevicePixelRatio();
    strip.setFiltering(qFuzzyCompare(pixels, double(m_size.width())) ? QSGTexture::Nearest : QSGTexture::Linear);
}

void RemoteSurfaceNode::update(const RemoteSurface &surface, const QRectF &target, const QRegion &damage,
                               bool everything)
{
    const bool rebuilt = surface.size() != m_size;
    const bool moved = target != m_target;
    m_target = target;
    if (rebuilt) {
        clear();
        m_size = surface.size();
    }
    if (rebuilt || everything || !damage.isEmpty())
        replaceTexture(surface);
    if (rebuilt) {
        build();
        return;
    }
    for (int index = 0; index < static_cast<int>(m_strips.size()); ++index) {
        auto *strip = m_strips[static_cast<std::size_t>(index)];
        if (moved)
            place(*strip, index);
        if (everything || damage.intersects(stripRectangle(m_size, index)))
            strip->markDirty(DirtyMaterial);
    }
}

} // namespace favrin::host
