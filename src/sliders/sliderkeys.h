#pragma once

#include <qnamespace.h>

#include <optional>

namespace favrin::sliders {

/**
 * The value that a key sets; none for a key that is not a slider's.
 * @param shownSteps how many steps between 0 and 1 the text beside the slider tells apart
 *
 * Arrows go one such step, from the nearest one; left and right follow @p direction. Page Up and Page Down go a tenth,
 * Home and End to 0 and 1.
 */
std::optional<double> valueForKey(int key, Qt::KeyboardModifiers modifiers, double value, int shownSteps,
                                  Qt::LayoutDirection direction);

} // namespace favrin::sliders
