#pragma once

#include <QColor>
#include <QPainterPath>

class QPainter;

namespace favrin::platform {

/** A picture whose content is one filled vector path. In the units and the place of the painter it is given to. */
struct ShapeView
{
    QPainterPath bezierPath;
    QColor fillColor = Qt::black;

    void draw(QPainter &painter) const;
    /**
     * Leaves of what the painter has painted within @p bounds only what lies under the filled path, its soft edges and
     * the opacity of the fill included.
     * @param bounds in whole pixels of the painter's device, from the painter's origin
     */
    void mask(QPainter &painter, const QRect &bounds) const;
};

} // namespace favrin::platform
