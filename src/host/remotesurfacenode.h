#pragma once

#include <QRectF>
#include <QRegion>
#include <QSGNode>

#include <memory>
#include <vector>

class QQuickWindow;
class QSGImageNode;
class QSGTexture;

namespace favrin::host {

class RemoteSurface;
class PaintedTile;

/**
 * The surface in the scene graph. The software scene graph repaints a node as a whole: there the surface is a grid of
 * tiles, of which those that changed are painted. A GPU draws it as one picture. Lives on the render thread; the
 * surface is read while the main thread waits.
 *
 * A transform node only because the software scene graph forgets where a plain node lies: tiles added to one later
 * would be drawn at the corner of the window.
 */
class RemoteSurfaceNode : public QSGTransformNode
{
public:
    explicit RemoteSurfaceNode(QQuickWindow &window);
    ~RemoteSurfaceNode() override;

    /** @p target in item coordinates; @p damage in pixels. */
    void update(const RemoteSurface &surface, const QRectF &target, const QRegion &damage, bool everything);

private:
    void updateTiles(const RemoteSurface &surface, const QRectF &target, const QRegion &damage, bool everything);
    void makeTiles(const RemoteSurface &surface, const QRectF &target);
    void updatePicture(const RemoteSurface &surface, const QRectF &target, bool isChanged);

    QQuickWindow &m_window;
    std::vector<PaintedTile *> m_tiles;
    int m_tilesAcross = 0;
    QSGImageNode *m_picture = nullptr;
    std::unique_ptr<QSGTexture> m_texture;
    QSize m_size;
    QRectF m_target;
};

} // namespace favrin::host
