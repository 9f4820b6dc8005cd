#include "apps/gallery/sheetshadow.h"

#include "platform/shapes/dropshadow.h"

#include <QPainter>

namespace favrin::gallery {

namespace {

constexpr double blurRadius = 28.0;
constexpr double drop = 10.0;

} // namespace

SheetShadow::SheetShadow(QQuickItem *parent) : CrispPaintedItem(parent)
{
    setOverhang(blurRadius + drop);
}

void SheetShadow::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const int room = overhangPixels(devicePixelRatio);
    QImage sheet(size + QSize(2 * room, 2 * room), QImage::Format_ARGB32_Premultiplied);
    sheet.fill(Qt::transparent);
    QPainter(&sheet).fillRect(QRect(QPoint(room, room), size), Qt::black);
    const QImage shadow = platform::dropShadow(sheet, blurRadius * devicePixelRatio, QColor(0, 0, 0, 70));
    painter.drawImage(QPointF(-room, -room + drop * devicePixelRatio), shadow);
}

} // namespace favrin::gallery
