#include "apps/eyedropper/picker/loupegeometry.h"

#include <QtMath>

#include <algorithm>

namespace favrin::eyedropper {

namespace {

int inPixels(double points, double scale)
{
    return std::max(1, qRound(points * scale));
}

/** The rectangle moved into @p room as far as it fits; its start stays visible when it does not. */
QRect movedInto(QRect rect, const QRect &room)
{
    rect.moveRight(std::min(rect.right(), room.right()));
    rect.moveLeft(std::max(rect.left(), room.left()));
    rect.moveBottom(std::min(rect.bottom(), room.bottom()));
    rect.moveTop(std::max(rect.top(), room.top()));
    return rect;
}

QRect centered(QSize size, QPoint center)
{
    return QRect(center - QPoint(size.width() / 2, size.height() / 2), size);
}

/** Above the finger when there is room, else below it or beside it. */
QRect discClearOfFinger(QPoint crosshair, const QRect &display, int diameter, const LoupeMetrics &metrics)
{
    const QRect over = centered({diameter, diameter}, crosshair);
    const int room = over.height() / 2 + metrics.fingerRoom;
    // Below, it has to clear the finger's whole tip.
    for (const QPoint way : {QPoint(0, -room), QPoint(0, room + metrics.fingerRoom)}) {
        const QRect disc = over.translated(way);
        if (disc.top() >= display.top() && disc.bottom() <= display.bottom())
            return movedInto(disc, display);
    }
    const bool isLeft = crosshair.x() > display.center().x();
    return movedInto(over.translated(isLeft ? -room : room, 0), display);
}

QRect labelBeside(const QRect &disc, QPoint crosshair, const QRect &display, QSize size, const LoupeMetrics &metrics)
{
    QRect below = centered(size, disc.center());
    QRect above = below;
    below.moveTop(disc.bottom() + 1 + metrics.gap);
    above.moveBottom(disc.top() - 1 - metrics.gap);
    // Away from the finger, when there is one between the loupe and what lies below it.
    const bool prefersAbove = crosshair.y() > disc.bottom();
    const bool fitsAbove = above.top() >= display.top();
    const bool fitsBelow = below.bottom() <= display.bottom();
    const bool isAbove = prefersAbove ? fitsAbove || !fitsBelow : !fitsBelow && fitsAbove;
    return movedInto(isAbove ? above : below, display);
}

/** Squared distance of @p pixel from the rectangle. */
qint64 distance(QPoint pixel, const QRect &rect)
{
    const QPoint inside(std::clamp(pixel.x(), rect.left(), rect.right()),
                        std::clamp(pixel.y(), rect.top(), rect.bottom()));
    const QPoint way = pixel - inside;
    return qint64(way.x()) * way.x() + qint64(way.y()) * way.y();
}

} // namespace

LoupeMetrics::LoupeMetrics(double pixelsPerPoint)
    : scale(pixelsPerPoint)
    , cell(inPixels(11, scale))
    , lens(cell * cellsAcross)
    , ring(inPixels(12, scale))
    , gap(inPixels(10, scale))
    , fingerRoom(inPixels(36, scale))
    , shadow(inPixels(14, scale))
{
}

bool LoupeGeometry::discContains(QPoint point) const
{
    const QPointF way = QPointF(point) + QPointF(0.5, 0.5) - QRectF(disc).center();
    return std::hypot(way.x(), way.y()) <= disc.width() / 2.0;
}

LoupeGeometry loupeGeometry(QPoint crosshair, const QRect &display, QSize label, LoupePlacement placement,
                            const LoupeMetrics &metrics)
{
    LoupeGeometry geometry;
    const int diameter = metrics.lens + 2 * metrics.ring;
    geometry.disc = placement == LoupePlacement::Around ? centered({diameter, diameter}, crosshair)
                                                        : discClearOfFinger(crosshair, display, diameter, metrics);
    geometry.lens = geometry.disc.adjusted(metrics.ring, metrics.ring, -metrics.ring, -metrics.ring);
    geometry.label = labelBeside(geometry.disc, crosshair, display, label, metrics);
    const int shadow = metrics.shadow;
    // The mark of the pixel itself is shown beside a loupe that does not stand around it.
    const QRect mark = centered({2 * shadow, 2 * shadow}, crosshair);
    geometry.bounds = geometry.disc.united(geometry.label).adjusted(-shadow, -shadow, shadow, shadow).united(mark);
    return geometry;
}

QPoint nearestPixel(QPoint pixel, const QList<QRect> &displays)
{
    if (displays.isEmpty())
        return pixel;
    const auto nearest =
        std::ranges::min_element(displays, {}, [pixel](const QRect &display) { return distance(pixel, display); });
    return {std::clamp(pixel.x(), nearest->left(), nearest->right()),
            std::clamp(pixel.y(), nearest->top(), nearest->bottom())};
}

} // namespace favrin::eyedropper
