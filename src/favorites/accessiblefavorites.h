#pragma once

namespace favrin::favorites {

/**
 * Lets assistive technologies see a FavoriteColorPickerView as a list of the cells that are on screen: each with its
 * label, selected or not, pressed to pick, and deleted by an action where it can be. Repeated calls do nothing.
 */
void installAccessibleFavorites();

} // namespace favrin::favorites
