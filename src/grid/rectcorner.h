#pragma once

#include <QFlags>

namespace favrin::grid {

/** A set of corners of a rectangle. */
enum class RectCorner : unsigned { topLeft = 1, topRight = 2, bottomLeft = 4, bottomRight = 8 };
Q_DECLARE_FLAGS(RectCorners, RectCorner)
Q_DECLARE_OPERATORS_FOR_FLAGS(RectCorners)

} // namespace favrin::grid
