#pragma once

#include "grid/gridrules.h"

namespace favrin::grid {

/**
 * The cell that a key selects; none for a key that is not the grid's. At an edge the cell stays where it is.
 * @param marked the cell that shows the selected color, if one does
 * @param start where the keys begin while no cell is marked: an arrow selects this one
 *
 * Arrows go to the neighbour; Home and End to the ends of the row, with Control to the first and the last cell; Page Up
 * and Page Down to the ends of the column. The grid is never mirrored, so neither are the keys.
 */
std::optional<CellPosition> cellForKey(int key, Qt::KeyboardModifiers modifiers, std::optional<CellPosition> marked,
                                       CellPosition start);

} // namespace favrin::grid
