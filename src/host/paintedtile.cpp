#include "host/paintedtile.h"

#include <QPainter>
#include <QQuickWindow>
#include <QSGRendererInterface>

namespace favrin::host {

namespace {

/** The region is one of the scene, so it comes before the transform. */
void clip(QPainter &painter, const QRegion &region, const QTransform &transform)
{
    painter.setTransform({});
    painter.setClipRegion(region, Qt::ReplaceClip);
    painter.setTransform(transform);
}

} // namespace

void PaintedTile::show(const QImage &image, const QRectF &target)
{
    m_image = image;
    m_target = target;
    markDirty(DirtyMaterial);
}

QRectF PaintedTile::rect() const
{
    const double pointsPerPixel = m_target.height() / m_image.height();
    return {m_target.topLeft() + QPointF(m_pixels.topLeft()) * pointsPerPixel,
            QSizeF(m_pixels.size()) * pointsPerPixel};
}

void PaintedTile::render(const RenderState *state)
{
    auto *painter = static_cast<QPainter *>(
        m_window.rendererInterface()->getResource(&m_window, QSGRendererInterface::PainterResource));
    if (!painter)
        return;
    painter->setOpacity(inheritedOpacity());
    painter->setRenderHint(QPainter::Antialiasing, false);
    const QTransform place = matrix()->toTransform();
    const QTransform pixelsToPlace =
        QTransform::fromScale(rect().width() / m_pixels.width(), rect().height() / m_pixels.height()) *
        QTransform::fromTranslate(m_target.x(), m_target.y()) * place;
    painter->setTransform(pixelsToPlace);
    if (painter->deviceTransform().type() > QTransform::TxTranslate) {
        painter->setRenderHint(QPainter::SmoothPixmapTransform);
        clip(*painter, *state->clipRegion(), place);
        painter->drawImage(rect(), m_image, m_pixels);
        return;
    }
    // Within one rectangle pixels are copied by the row, and looked up span by span within any other region.
    for (const QRect &rectangle : *state->clipRegion()) {
        clip(*painter, rectangle, pixelsToPlace);
        painter->drawImage(m_pixels.topLeft(), m_image, m_pixels);
    }
}

} // namespace favrin::host
