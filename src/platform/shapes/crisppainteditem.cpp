#include "platform/shapes/crisppainteditem.h"

#include <QImage>
#include <QPainter>
#include <QQuickWindow>
#include <QSGImageNode>

#include <algorithm>
#include <cmath>
#include <memory>

namespace favrin::platform {
namespace {

/** No surface is larger; beyond this an item is not painted rather than memory being asked for. */
constexpr int largestPixelExtent = 8192;

int roundedPixels(double points, double devicePixelRatio)
{
    const double pixels = std::round(points * devicePixelRatio);
    return pixels > 0.0 ? static_cast<int>(std::min(pixels, largestPixelExtent + 1.0)) : 0;
}

/** The picture in the scene graph, with its texture: not every scene graph's image node deletes a replaced texture. */
class PictureNode : public QSGNode
{
public:
    explicit PictureNode(QSGImageNode *image) : m_image(image)
    {
        image->setFiltering(QSGTexture::Nearest);
        appendChildNode(image);
    }

    void setTexture(std::unique_ptr<QSGTexture> texture)
    {
        m_image->setTexture(texture.get());
        m_texture = std::move(texture);
    }

    void place(QPointF topLeft, double devicePixelRatio)
    {
        m_image->setRect(QRectF(topLeft, QSizeF(m_texture->textureSize()) / devicePixelRatio));
    }

private:
    QSGImageNode *m_image;
    std::unique_ptr<QSGTexture> m_texture;
};

/** How far an item must be shifted, in points, to lie on whole pixels. */
QPointF offsetToPixels(const QQuickItem &item, double devicePixelRatio)
{
    const QPointF position = item.mapToScene(QPointF()) * devicePixelRatio;
    return QPointF(std::round(position.x()) - position.x(), std::round(position.y()) - position.y()) / devicePixelRatio;
}

} // namespace

CrispPaintedItem::CrispPaintedItem(QQuickItem *parent) : QQuickItem(parent)
{
    setFlag(ItemHasContents);
}

void CrispPaintedItem::setOverhang(double overhang)
{
    if (overhang == m_overhang)
        return;
    m_overhang = overhang;
    repaint();
}

QSize CrispPaintedItem::pixelSize(double devicePixelRatio) const
{
    return {roundedPixels(width(), devicePixelRatio), roundedPixels(height(), devicePixelRatio)};
}

int CrispPaintedItem::overhangPixels(double devicePixelRatio) const
{
    return static_cast<int>(std::ceil(m_overhang * devicePixelRatio));
}

QImage CrispPaintedItem::render(double devicePixelRatio)
{
    const QSize size = pixelSize(devicePixelRatio);
    const int margin = overhangPixels(devicePixelRatio);
    const QSize imageSize = size.grownBy({margin, margin, margin, margin});
    if (size.isEmpty() || std::max(imageSize.width(), imageSize.height()) > largestPixelExtent)
        return {};
    QImage image(imageSize, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(margin, margin);
    paint(painter, size, devicePixelRatio);
    return image;
}

void CrispPaintedItem::repaint()
{
    m_dirty = true;
    update();
}

void CrispPaintedItem::geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChange(newGeometry, oldGeometry);
    if (newGeometry.size() != oldGeometry.size())
        m_dirty = true;
    update();
}

void CrispPaintedItem::itemChange(ItemChange change, const ItemChangeData &value)
{
    if (change == ItemDevicePixelRatioHasChanged || change == ItemSceneChange)
        repaint();
    QQuickItem::itemChange(change, value);
}

QSGNode *CrispPaintedItem::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    const double ratio = window()->effectiveDevicePixelRatio();
    std::unique_ptr<PictureNode> node(static_cast<PictureNode *>(oldNode));
    if (m_dirty || !node) {
        const QImage image = render(ratio);
        if (image.isNull())
            return nullptr;
        if (!node)
            node = std::make_unique<PictureNode>(window()->createImageNode());
        node->setTexture(std::unique_ptr<QSGTexture>(window()->createTextureFromImage(image)));
        m_dirty = false;
    }
    const QPointF margin(overhangPixels(ratio), overhangPixels(ratio));
    node->place(offsetToPixels(*this, ratio) - margin / ratio, ratio);
    return node.release();
}

} // namespace favrin::platform
