#pragma once

#include "favorites/itemlist.h"
#include "favorites/pagelayout.h"

#include <QtGlobal>

namespace favrin::favorites {

/**
 * The item that a key moves to from the one at @p place; none for a key that does not move. Where there is nothing to
 * move to, the place stays. Fillers are passed over.
 *
 * Left and right go on in reading order, mirrored where the writing direction is; up and down to the other row of the
 * page; Page Up and Page Down to the same spot of the page before and after; Home and End to the first and last item.
 */
std::optional<int> placeForKey(int key, const ItemList &items, const PageLayout &layout, int place,
                               Qt::LayoutDirection direction);

/** Where the keys begin on a page: at its first selected item, else its first item that is no filler. */
std::optional<int> startingPlace(const ItemList &items, const PageLayout &layout, int page,
                                 const std::vector<int> &selected);

} // namespace favrin::favorites
