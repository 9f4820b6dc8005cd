#pragma once

#include "favorites/coloritem.h"

#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace favrin::service {
class ColorPickerState;
}

/** What the strip holds: plain functions. */
namespace favrin::favorites {

using ItemList = std::vector<ColorItem>;

/** For each color, the occurrence numbers of its deleted favorites. They are never given again. */
using DeletedIndexes = std::unordered_map<model::SomeColor, std::unordered_set<int>>;

/**
 * The items that the strip shows for @p state, in order: the remove button when no color may be chosen, the suggested
 * colors and the fillers up to a new page, the favorites, the add button when a color is selected.
 *
 * The fillers leave the remove button out of account, and are a whole page after suggested colors that fill theirs.
 * @param swatchesPerPage at least 2
 */
ItemList itemList(const service::ColorPickerState &state, int swatchesPerPage, const DeletedIndexes &deletedIndexes);

/**
 * The places of the items that show the selected color, increasing; every swatch of about this color and opacity. The
 * remove button's when no color is selected.
 */
std::vector<int> selectedPlaces(const ItemList &items, const std::optional<model::SomeColor> &selectedColor);

/** The place of a favorite's item among the favorites' items of the list; none for any other item. */
std::optional<std::size_t> favoritePlace(const ItemList &items, const ColorItem &item);

} // namespace favrin::favorites
