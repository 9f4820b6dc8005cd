#include "favorites/stripkeys.h"

#include <algorithm>

namespace favrin::favorites {
namespace {

bool isFiller(const ItemList &items, int place)
{
    return items[static_cast<std::size_t>(place)].kind == ColorItem::Kind::filler;
}

/** The next item that is no filler, from @p place on and including it; none when the list ends. */
std::optional<int> nextItem(const ItemList &items, int place, int step)
{
    for (; place >= 0 && place < static_cast<int>(items.size()); place += step) {
        if (!isFiller(items, place))
            return place;
    }
    return std::nullopt;
}

std::optional<int> itemInOtherRow(const ItemList &items, const PageLayout &layout, int place, int rows)
{
    const int target = place + rows * layout.columns();
    const bool exists = target >= 0 && target < static_cast<int>(items.size());
    if (!exists || layout.pageOf(target) != layout.pageOf(place) || isFiller(items, target))
        return std::nullopt;
    return target;
}

std::optional<int> itemOnOtherPage(const ItemList &items, const PageLayout &layout, int place, int pages)
{
    const int target = place + pages * layout.swatchesPerPage();
    const int last = static_cast<int>(items.size()) - 1;
    if (target < 0 || layout.pageOf(target) > layout.pageOf(last))
        return std::nullopt;
    // A page may be full of fillers: then the one behind it is meant.
    return nextItem(items, std::min(target, last), pages);
}

} // namespace

std::optional<int> placeForKey(int key, const ItemList &items, const PageLayout &layout, int place,
                               Qt::LayoutDirection direction)
{
    const int forward = direction == Qt::LeftToRight ? 1 : -1;
    const int last = static_cast<int>(items.size()) - 1;
    const auto orStay = [place](std::optional<int> target) { return target.value_or(place); };
    switch (key) {
    case Qt::Key_Right:
        return orStay(nextItem(items, place + forward, forward));
    case Qt::Key_Left:
        return orStay(nextItem(items, place - forward, -forward));
    case Qt::Key_Up:
        return orStay(itemInOtherRow(items, layout, place, -1));
    case Qt::Key_Down:
        return orStay(itemInOtherRow(items, layout, place, 1));
    case Qt::Key_PageUp:
        return orStay(itemOnOtherPage(items, layout, place, -1));
    case Qt::Key_PageDown:
        return orStay(itemOnOtherPage(items, layout, place, 1));
    case Qt::Key_Home:
        return orStay(nextItem(items, 0, 1));
    case Qt::Key_End:
        return orStay(nextItem(items, last, -1));
    default:
        return std::nullopt;
    }
}

std::optional<int> startingPlace(const ItemList &items, const PageLayout &layout, int page,
                                 const std::vector<int> &selected)
{
    const int first = page * layout.swatchesPerPage();
    const auto found = std::ranges::lower_bound(selected, first);
    if (found != selected.end() && layout.pageOf(*found) == page)
        return *found;
    const auto after = nextItem(items, first, 1);
    return after ? after : nextItem(items, std::min(first, static_cast<int>(items.size()) - 1), -1);
}

} // namespace favrin::favorites
