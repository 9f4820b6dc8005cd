#pragma once

namespace favrin::grid {

/**
 * Lets assistive technologies see a ColorSwatchPickerView as a list of its cells: each with its color's name, selected
 * or not, and pressed to pick. The cells' objects are made when somebody asks for them. Repeated calls do nothing.
 */
void installAccessibleSwatchGrid();

} // namespace favrin::grid
