#pragma once

#include "service/colorpickerstate.h"

#include <vector>

namespace favrin::grid {

/** Rows of equal length; row 0 is the top row, column 0 the leftmost swatch. All colors are in sRGB. */
using ColorMatrix = std::vector<std::vector<model::SomeColor>>;

/** The 10 rows of 12 preset colors, opaque. Built on first use, never changed afterwards; any thread. */
const ColorMatrix &defaultColorMatrix();

/**
 * The palette for the dark appearance: the gray ramp from black to white, then the hues from light to dark, each color
 * replaced by its counterpart in the dark appearance. Built on first use, never changed afterwards; any thread.
 */
const ColorMatrix &darkColorMatrix();

/** Whether the dark palette is to be shown in an environment of @p colorScheme. */
bool usesDarkPalette(const service::ColorPickerState &state, service::ColorScheme colorScheme);

/** The palette to be shown in an environment of @p colorScheme. */
const ColorMatrix &activePalette(const service::ColorPickerState &state, service::ColorScheme colorScheme);

} // namespace favrin::grid
