#include "favorites/listdifference.h"

#include <algorithm>
#include <span>

namespace favrin::favorites {
namespace {

using Items = std::span<const ColorItem>;
constexpr int absent = -1;

void append(int place, std::vector<PlaceRange> &ranges)
{
    if (!ranges.empty() && ranges.back().first + ranges.back().count == place)
        ++ranges.back().count;
    else
        ranges.push_back({place, 1});
}

/** Of two lists that differ at both ends. @p offset is where both start. */
ListDifference differenceOfMiddles(Items oldItems, Items newItems, int offset)
{
    std::unordered_map<ColorItem, int> newPlaces;
    newPlaces.reserve(newItems.size());
    for (const ColorItem &item : newItems)
        newPlaces.emplace(item, static_cast<int>(newPlaces.size()));

    ListDifference difference;
    // By new place: the old one among those that stay.
    std::vector<int> origins(newItems.size(), absent);
    int staying = 0;
    for (std::size_t place = 0; place < oldItems.size(); ++place) {
        const auto found = newPlaces.find(oldItems[place]);
        if (found == newPlaces.end())
            append(offset + static_cast<int>(place), difference.removals);
        else
            origins[static_cast<std::size_t>(found->second)] = staying++;
    }
    std::vector<int> order;
    for (std::size_t place = 0; place < origins.size(); ++place) {
        if (origins[place] == absent)
            append(offset + static_cast<int>(place), difference.insertions);
        else
            order.push_back(origins[place]);
    }
    if (!std::ranges::is_sorted(order))
        difference.order = std::move(order);
    return difference;
}

/** Of the items of the middle to that of all, those before and after it included. */
std::vector<int> orderOfAll(const std::vector<int> &order, int before, int after)
{
    const int all = before + static_cast<int>(order.size()) + after;
    std::vector<int> result(static_cast<std::size_t>(all));
    for (int place = 0; place < all; ++place) {
        const bool inMiddle = place >= before && place < all - after;
        result[static_cast<std::size_t>(place)] =
            inMiddle ? before + order[static_cast<std::size_t>(place - before)] : place;
    }
    return result;
}

} // namespace

ListDifference listDifference(const ItemList &oldList, const ItemList &newList)
{
    Items oldItems(oldList);
    Items newItems(newList);
    // Nearly always the lists differ in one place: what lies around it needs no hashing.
    const auto firstDifference = std::ranges::mismatch(oldItems, newItems).in1 - oldItems.begin();
    oldItems = oldItems.subspan(static_cast<std::size_t>(firstDifference));
    newItems = newItems.subspan(static_cast<std::size_t>(firstDifference));
    std::size_t after = 0;
    while (after < std::min(oldItems.size(), newItems.size()) &&
           oldItems[oldItems.size() - 1 - after] == newItems[newItems.size() - 1 - after])
        ++after;

    const int before = static_cast<int>(firstDifference);
    auto difference =
        differenceOfMiddles(oldItems.first(oldItems.size() - after), newItems.first(newItems.size() - after), before);
    if (!difference.order.empty())
        difference.order = orderOfAll(difference.order, before, static_cast<int>(after));
    return difference;
}

} // namespace favrin::favorites
