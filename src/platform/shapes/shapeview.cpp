#include "platform/shapes/shapeview.h"

#include <QPainter>

namespace favrin::platform {

void ShapeView::draw(QPainter &painter) const
{
    painter.fillPath(bezierPath, fillColor);
}

QImage ShapeView::picture(const QRect &bounds) const
{
    QImage image(bounds.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(-bounds.topLeft());
    draw(painter);
    return image;
}

void ShapeView::mask(QPainter &painter, const QRect &bounds) const
{
    // Through a picture: a path alone composes only where it lies, and leaves the rest as it was.
    mask(painter, bounds.topLeft(), picture(bounds));
}

void ShapeView::mask(QPainter &painter, QPoint topLeft, const QImage &picture)
{
    const auto mode = painter.compositionMode();
    painter.setCompositionMode(QPainter::CompositionMode_DestinationIn);
    painter.drawImage(topLeft, picture);
    painter.setCompositionMode(mode);
}

} // namespace favrin::platform
