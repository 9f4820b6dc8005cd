#pragma once

#include <QImage>
#include <QRect>
#include <QSGRenderNode>

class QQuickWindow;

namespace favrin::host {

/**
 * A part of an image in the software scene graph. An image node would draw at every scale but 1 and 2 by looking up
 * each pixel by itself, though the image has a pixel for each one of the window.
 */
class PaintedTile : public QSGRenderNode
{
public:
    /** @param pixels the part of the image */
    PaintedTile(QQuickWindow &window, const QRect &pixels) : m_window(window), m_pixels(pixels) {}

    const QRect &pixels() const { return m_pixels; }
    /** Shows its part of @p image; all of the image would fill @p target, in points. The pixels are not copied. */
    void show(const QImage &image, const QRectF &target);

    RenderingFlags flags() const override { return BoundedRectRendering; }
    QRectF rect() const override;
    void render(const RenderState *state) override;

private:
    QQuickWindow &m_window;
    QRect m_pixels;
    QImage m_image;
    QRectF m_target;
};

} // namespace favrin::host
