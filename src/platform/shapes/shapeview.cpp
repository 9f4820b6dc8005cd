#include "platform/shapes/shapeview.h"

#include <QImage>
#include <QPainter>

namespace favrin::platform {

void ShapeView::draw(QPainter &painter) const
{
    painter.fillPath(bezierPath, fillColor);
}

void ShapeView::mask(QPainter &painter, const QRect &bounds) const
{
    // Through an image: a path alone composes only where it lies, and leaves the rest as it was.
    QImage image(bounds.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter maskPainter(&image);
    maskPainter.setRenderHint(QPainter::Antialiasing);
    maskPainter.translate(-bounds.topLeft());
    draw(maskPainter);
    maskPainter.end();

    const auto mode = painter.compositionMode();
    painter.setCompositionMode(QPainter::CompositionMode_DestinationIn);
    painter.drawImage(bounds.topLeft(), image);
    painter.setCompositionMode(mode);
}

} // namespace favrin::platform
