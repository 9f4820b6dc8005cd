#pragma once

#include <QImage>
#include <QRect>

namespace favrin::gallery {

/**
 * The tallest band inside @p within where the picture is colorful from side to side: where a picker shows its colors.
 * Empty when there is none. In pixels of @p picture.
 */
QRect vividArea(const QImage &picture, const QRect &within);

} // namespace favrin::gallery
