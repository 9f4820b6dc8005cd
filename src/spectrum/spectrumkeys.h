#pragma once

#include <QPointF>
#include <QSizeF>

#include <optional>

namespace favrin::spectrum {

/**
 * The point of a spectrum of @p size to which a key moves the pick from @p from; none for a key that is not the
 * spectrum's. At an edge the point stays on it.
 *
 * Arrows move by a hundredth of the field, with Shift by a tenth; Page Up and Page Down by one of the six pure hues,
 * Home to the first and End to the last hue. The field is never mirrored, so neither are the keys.
 */
std::optional<QPointF> pointForKey(int key, Qt::KeyboardModifiers modifiers, QPointF from, QSizeF size);

} // namespace favrin::spectrum
