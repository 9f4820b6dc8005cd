#pragma once

#include <QPainterPath>

namespace favrin::shell {

/** The half of a rectangle above its rising diagonal. */
QPainterPath triangle(const QRectF &rect);

} // namespace favrin::shell
