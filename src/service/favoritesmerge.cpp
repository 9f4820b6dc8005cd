#include "service/favoritesmerge.h"

#include "service/collectiondifference.h"

#include <algorithm>
#include <iterator>

namespace favrin::service {

using model::SomeColor;
using ColorList = std::vector<SomeColor>;

namespace {

/** Removes the element equal to @p color that has @p skipped equal elements before it; without one, removes nothing. */
void removeOccurrence(ColorList &list, const SomeColor &color, std::ptrdiff_t skipped)
{
    for (auto element = list.begin(); element != list.end(); ++element) {
        if (*element != color)
            continue;
        if (skipped == 0) {
            list.erase(element);
            return;
        }
        --skipped;
    }
}

} // namespace

ColorList opaqueColors(const ColorList &colors)
{
    ColorList opaque;
    std::ranges::copy_if(colors, std::back_inserter(opaque), [](const SomeColor &color) { return color.a == 1.0; });
    return opaque;
}

ColorList mergedFavorites(ColorList stored, const ColorList &edited)
{
    const ColorList visible = opaqueColors(stored);
    const CollectionDifference edit = difference<SomeColor>(visible, edited);
    for (const std::size_t offset : edit.removals) {
        // Of equal colors the edit keeps the ones before this offset; those are skipped in the stored list too.
        const auto before = edited.begin() + static_cast<std::ptrdiff_t>(std::min(offset, edited.size()));
        const SomeColor &removed = visible[offset];
        removeOccurrence(stored, removed, std::count(edited.begin(), before, removed));
    }
    for (const std::size_t offset : edit.insertions)
        stored.push_back(edited[offset]);
    return stored;
}

} // namespace favrin::service
