#pragma once

#include "favorites/itemlist.h"

namespace favrin::favorites {

/** Neighbouring places: the first, and how many. */
struct PlaceRange
{
    int first = 0;
    int count = 0;

    bool operator==(const PlaceRange &) const = default;
};

/**
 * What turns one list of items into another, told by their identities: what goes, how the rest changes its order, what
 * comes. Time and memory grow with the lengths of the lists alone.
 */
struct ListDifference
{
    /** Places in the old list, increasing. */
    std::vector<PlaceRange> removals;
    /** For each item that stays, in its new order: its place among those that stay in the old order. Empty: unmoved. */
    std::vector<int> order;
    /** Places in the new list, increasing. */
    std::vector<PlaceRange> insertions;

    bool isEmpty() const { return removals.empty() && order.empty() && insertions.empty(); }
};

/** No item may stand twice in a list. */
ListDifference listDifference(const ItemList &oldList, const ItemList &newList);

} // namespace favrin::favorites
