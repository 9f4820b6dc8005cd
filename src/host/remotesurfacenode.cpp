#include "host/remotesurfacenode.h"

#include "host/paintedtile.h"
#include "host/session/remotesurface.h"

#include <QQuickWindow>
#include <QSGImageNode>
#include <QSGRendererInterface>
#include <QSGTexture>

#include <utility>

namespace favrin::host {

namespace {

/** Pixels; small enough that a moved marker repaints little, large enough that a full repaint is one of few parts. */
constexpr int tileHeight = 64;
constexpr int tilesAcross = 6;

/** Each pixel of the surface is one of the window. */
bool isExact(const QQuickWindow &window, const RemoteSurface &surface, const QRectF &target)
{
    return qFuzzyCompare(target.width() * window.effectiveDevicePixelRatio(), double(surface.size().width()));
}

} // namespace

RemoteSurfaceNode::RemoteSurfaceNode(QQuickWindow &window) : m_window(window) {}

RemoteSurfaceNode::~RemoteSurfaceNode() = default;

void RemoteSurfaceNode::update(const RemoteSurface &surface, const QRectF &target, const QRegion &damage,
                               bool everything)
{
    if (m_window.rendererInterface()->graphicsApi() == QSGRendererInterface::Software)
        updateTiles(surface, target, damage, everything);
    else
        updatePicture(surface, target, everything || !damage.isEmpty());
    m_size = surface.size();
    m_target = target;
}

void RemoteSurfaceNode::updateTiles(const RemoteSurface &surface, const QRectF &target, const QRegion &damage,
                                    bool everything)
{
    // Smoothing ends at the edges of what is drawn, and upright edges show.
    const int across = isExact(m_window, surface, target) ? tilesAcross : 1;
    if (std::exchange(m_tilesAcross, across) != across || surface.size() != m_size) {
        makeTiles(surface, target);
        return;
    }
    const bool isAllNew = everything || target != m_target;
    for (PaintedTile *tile : m_tiles) {
        if (isAllNew || damage.intersects(tile->pixels()))
            tile->show(surface.image(), target);
    }
}

void RemoteSurfaceNode::makeTiles(const RemoteSurface &surface, const QRectF &target)
{
    for (PaintedTile *tile : std::exchange(m_tiles, {})) {
        removeChildNode(tile);
        delete tile;
    }
    const QRect whole(QPoint(), surface.size());
    const QSize size((whole.width() + m_tilesAcross - 1) / m_tilesAcross, tileHeight);
    for (int y = 0; y < whole.height(); y += size.height()) {
        for (int x = 0; x < whole.width(); x += size.width()) {
            auto *tile = new PaintedTile(m_window, QRect(QPoint(x, y), size) & whole);
            tile->show(surface.image(), target);
            // Only now: the software scene graph looks at a node as soon as it is added.
            appendChildNode(tile);
            m_tiles.push_back(tile);
        }
    }
}

void RemoteSurfaceNode::updatePicture(const RemoteSurface &surface, const QRectF &target, bool isChanged)
{
    const bool isFirst = !m_picture;
    if (isFirst) {
        m_picture = m_window.createImageNode();
        m_picture->setOwnsTexture(false);
    }
    std::unique_ptr<QSGTexture> previous;
    if (isFirst || isChanged) {
        // A copy: the texture is uploaded later, on the thread that renders.
        previous = std::exchange(m_texture, std::unique_ptr<QSGTexture>(m_window.createTextureFromImage(
                                                surface.image().copy(), QQuickWindow::TextureHasAlphaChannel)));
        m_picture->setTexture(m_texture.get());
    }
    m_picture->setFiltering(isExact(m_window, surface, target) ? QSGTexture::Nearest : QSGTexture::Linear);
    m_picture->setSourceRect(QRectF(QPointF(), surface.size()));
    m_picture->setRect(target);
    if (isFirst)
        appendChildNode(m_picture);
}

} // namespace favrin::host
