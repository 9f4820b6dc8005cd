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

/**
 * The surface in the scene graph: strips that share one texture, so that the software scene graph repaints only those
 * that changed. Lives on the render thread; the surface is read while the main thread waits.
 *
 * A transform node only because the software scene graph forgets where a plain node lies: strips added to one later
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
    void clear();
    void replaceTexture(const RemoteSurface &surface);
    void build();
    void place(QSGImageNode &strip, int index) const;

    QQuickWindow &m_window;
    std::unique_ptr<QSGTexture> m_texture;
    std::vector<QSGImageNode *> m_strips;
    QSize m_size;
    QRectF m_target;
};

} // namespace favrin::host
