#include "favorites/itemlist.h"

#include "service/colorpickerstate.h"

namespace favrin::favorites {

using model::SomeColor;

namespace {

void appendSuggestedColors(const std::vector<SomeColor> &colors, int swatchesPerPage, ItemList &items)
{
    const auto count = static_cast<int>(colors.size());
    if (count == 0)
        return;
    for (int index = 0; index < count; ++index)
        items.push_back(ColorItem::suggestedColor(colors[static_cast<std::size_t>(index)], index));
    const int fillers = swatchesPerPage - count % swatchesPerPage;
    for (int index = 0; index < fillers; ++index)
        items.push_back(ColorItem::filler(index));
}

void appendFavorites(const std::vector<SomeColor> &colors, const DeletedIndexes &deletedIndexes, ItemList &items)
{
    /** What the next favorite of a color needs to know. */
    struct Occurrences
    {
        int next = 0;
        const std::unordered_set<int> *deleted = nullptr;
    };
    std::unordered_map<SomeColor, Occurrences> occurrences;
    occurrences.reserve(colors.size());
    for (const SomeColor &color : colors) {
        const auto [entry, isNew] = occurrences.try_emplace(color);
        auto &[next, deleted] = entry->second;
        if (isNew && !deletedIndexes.empty()) {
            const auto found = deletedIndexes.find(color);
            deleted = found != deletedIndexes.end() ? &found->second : nullptr;
        }
        while (deleted && deleted->contains(next))
            ++next;
        items.push_back(ColorItem::favoriteColor(color, next++));
    }
}

} // namespace

ItemList itemList(const service::ColorPickerState &state, int swatchesPerPage, const DeletedIndexes &deletedIndexes)
{
    ItemList items;
    items.reserve(state.favoriteColors().size() + 2);
    if (state.allowsNoColor())
        items.push_back(ColorItem::removeButton());
    if (const auto &suggested = state.suggestedColors())
        appendSuggestedColors(*suggested, swatchesPerPage, items);
    appendFavorites(state.favoriteColors(), deletedIndexes, items);
    if (state.hasSelectedColor())
        items.push_back(ColorItem::addButton());
    return items;
}

std::vector<int> selectedPlaces(const ItemList &items, const std::optional<SomeColor> &selectedColor)
{
    const auto isSelected = [&selectedColor](const ColorItem &item) {
        if (!selectedColor)
            return item.kind == ColorItem::Kind::removeButton;
        return item.color && item.color->isApproximatelyEqual(*selectedColor);
    };
    std::vector<int> places;
    for (std::size_t place = 0; place < items.size(); ++place) {
        if (isSelected(items[place]))
            places.push_back(static_cast<int>(place));
    }
    return places;
}

std::optional<std::size_t> favoritePlace(const ItemList &items, const ColorItem &item)
{
    if (item.kind != ColorItem::Kind::color)
        return std::nullopt;
    std::size_t place = 0;
    for (const ColorItem &other : items) {
        if (other == item)
            return place;
        place += other.kind == ColorItem::Kind::color ? 1 : 0;
    }
    return std::nullopt;
}

} // namespace favrin::favorites
