#include "sliders/capsule.h"

#include <QPainter>
#include <QPainterPath>

namespace favrin::sliders {
namespace {

QPainterPath capsule(const QRectF &rect)
{
    QPainterPath path;
    path.addRoundedRect(rect, rect.height() / 2.0, rect.height() / 2.0);
    return path;
}

template<class Draw>
QImage picture(QSize size, Draw draw)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    draw(painter);
    return image;
}

} // namespace

Capsule::Capsule(QSize size) : m_size(size)
{
    if (size.isEmpty())
        return;
    const QImage whole =
        picture(size, [&](QPainter &painter) { painter.fillPath(capsule(QRect(QPoint(), size)), Qt::black); });
    const bool hasEnds = size.width() > size.height();
    const int end = hasEnds ? (size.height() + 1) / 2 : size.width();
    m_left = whole.copy(0, 0, end, size.height());
    if (hasEnds)
        m_right = whole.copy(size.width() - end, 0, end, size.height());
}

void Capsule::cut(QPainter &picture) const
{
    picture.setCompositionMode(QPainter::CompositionMode_DestinationIn);
    picture.drawImage(0, 0, m_left);
    picture.drawImage(m_size.width() - m_right.width(), 0, m_right);
}

void Capsule::outline(QPainter &painter, const QColor &color)
{
    if (m_outline.isNull() || m_outlineColor != color.rgba()) {
        m_outlineColor = color.rgba();
        m_outline = picture(m_size, [&](QPainter &outline) {
            outline.strokePath(capsule(QRectF(QPointF(), m_size).adjusted(0.5, 0.5, -0.5, -0.5)), QPen(color, 1.0));
        });
    }
    painter.drawImage(0, 0, m_outline);
}

} // namespace favrin::sliders
