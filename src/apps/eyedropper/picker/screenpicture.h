#pragma once

#include "platform/color/color.h"

#include <QImage>

#include <optional>

struct xcb_connection_t;

namespace favrin::eyedropper {

/** The pixels of an X server's screen are of a kind that can be read here. */
bool screenCanBeRead(xcb_connection_t *connection);

/** The whole of an X server's screen as it is now, pixel by pixel; none with a kind of screen that cannot be read. */
std::optional<QImage> pictureOfScreen(xcb_connection_t *connection);

/** The color of one pixel, exactly: its number divided by the largest. The pixel must lie in the picture. */
platform::Color colorOfPixel(const QImage &picture, QPoint pixel);

} // namespace favrin::eyedropper
