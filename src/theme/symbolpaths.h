#pragma once

#include <QPainterPath>

namespace favrin::theme {

enum class SymbolKind { Disc, Cross, Eyedropper, CheckMark, UpDownChevrons };

/**
 * The outline of a symbol, to be filled: it fills @p bounds, in whatever unit that is, and its parts do not overlap, so
 * that a translucent color is even. The eyedropper and the disc keep their proportions in the middle of @p bounds.
 */
QPainterPath symbolPath(SymbolKind kind, const QRectF &bounds);

} // namespace favrin::theme
