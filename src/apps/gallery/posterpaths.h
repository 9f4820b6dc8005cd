#pragma once

#include "apps/gallery/poster.h"

#include <QPainterPath>

namespace favrin::gallery {

/** The sheet that the paths below are drawn on, in units of its own; y grows downward. */
inline constexpr QSizeF sheetSize(600.0, 840.0);

/** Outline of @p part on the sheet; the ink is lettering and has none. */
QPainterPath posterPath(Poster::Part part);

} // namespace favrin::gallery
