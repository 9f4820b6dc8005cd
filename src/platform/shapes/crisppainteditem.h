#pragma once

#include <QQuickItem>

class QPainter;

namespace favrin::platform {

/**
 * An item painted by a QPainter into an image of exactly the pixels that it covers, placed on whole pixels of the
 * window: nothing is resampled at any scale factor, fractional ones too, and every scene graph shows the same picture.
 *
 * The painted area may reach beyond the item's bounds by an overhang. Moving the item does not paint it anew.
 */
class CrispPaintedItem : public QQuickItem
{
    Q_OBJECT

public:
    explicit CrispPaintedItem(QQuickItem *parent = nullptr);

    /** Points that the picture reaches beyond each edge of the item; 0 at first. */
    double overhang() const { return m_overhang; }
    void setOverhang(double overhang);

    /**
     * What the item looks like at @p devicePixelRatio, in pixels; the item's origin lies overhangPixels() inside.
     * The device pixel ratio of the image is left at 1.
     */
    virtual QImage render(double devicePixelRatio);
    /** The item's size in whole pixels. */
    QSize pixelSize(double devicePixelRatio) const;
    int overhangPixels(double devicePixelRatio) const;

protected:
    /**
     * Paints the item. The painter works in pixels, antialiased, its origin at the item's top left corner.
     * @param size the item's size in pixels
     */
    virtual void paint(QPainter &painter, QSize size, double devicePixelRatio) = 0;

    /** Has the item painted anew before the next frame. */
    void repaint();

    void geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    void itemChange(ItemChange change, const ItemChangeData &value) override;
    QSGNode *updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *data) override;

private:
    double m_overhang = 0.0;
    bool m_dirty = true;
};

} // namespace favrin::platform
