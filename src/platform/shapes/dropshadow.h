#pragma once

#include <QColor>
#include <QImage>

namespace favrin::platform {

/**
 * The shadow that the opaque parts of @p shape cast straight down: an image of the same size, premultiplied.
 * @param blurRadius in pixels of the image, twice the standard deviation of the blur; keep that much room at the edges
 * @param color the color of the shadow, its opacity included
 */
QImage dropShadow(const QImage &shape, double blurRadius, const QColor &color);

} // namespace favrin::platform
