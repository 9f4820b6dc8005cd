#pragma once

#include <QColor>
#include <QImage>
#include <QPainterPath>

class QPainter;

namespace favrin::platform {

/** A picture whose content is one filled vector path. In the units and the place of the painter it is given to. */
struct ShapeView
{
    QPainterPath bezierPath;
    QColor fillColor = Qt::black;

    void draw(QPainter &painter) const;
    /** The filled path over nothing: what lies within @p bounds, for one who keeps it and masks with it often. */
    QImage picture(const QRect &bounds) const;
    /**
     * Leaves of what the painter has painted within @p bounds only what lies under the filled path, its soft edges and
     * the opacity of the fill included.
     * @param bounds in whole pixels of the painter's device, from the painter's origin
     */
    void mask(QPainter &painter, const QRect &bounds) const;
    /** The same with a picture of the shape; its top left corner comes to @p topLeft. */
    static void mask(QPainter &painter, QPoint topLeft, const QImage &picture);
};

} // namespace favrin::platform
