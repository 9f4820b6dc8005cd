#include "apps/gallery/vividarea.h"

#include <algorithm>

namespace favrin::gallery {

namespace {

bool isVivid(QRgb pixel)
{
    const auto [low, high] = std::minmax({qRed(pixel), qGreen(pixel), qBlue(pixel)});
    return high - low > 40;
}

/** The vivid part of a row when that is most of the row, otherwise nothing. */
QRect vividPart(const QImage &picture, const QRect &within, int y)
{
    int first = within.right() + 1;
    int last = within.left() - 1;
    int count = 0;
    for (int x = within.left(); x <= within.right(); ++x) {
        if (!isVivid(picture.pixel(x, y)))
            continue;
        first = std::min(first, x);
        last = x;
        ++count;
    }
    return count * 2 > within.width() ? QRect(QPoint(first, y), QPoint(last, y)) : QRect();
}

} // namespace

QRect vividArea(const QImage &picture, const QRect &within)
{
    const QRect bounds = within & picture.rect();
    QRect tallest;
    QRect current;
    for (int y = bounds.top(); y <= bounds.bottom(); ++y) {
        const QRect part = vividPart(picture, bounds, y);
        current = part.isNull() ? QRect() : current | part;
        if (current.height() > tallest.height())
            tallest = current;
    }
    return tallest;
}

} // namespace favrin::gallery
