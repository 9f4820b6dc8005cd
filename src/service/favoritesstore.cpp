#include "service/favoritesstore.h"

#include "model/colorcoding.h"
#include "service/colorpickerlog.h"
#include "service/defaultfavorites.h"
#include "service/favoritesmerge.h"

#include <algorithm>

namespace favrin::service {

using platform::Bytes;
using platform::DefaultsArray;
using platform::DefaultsValue;
using ColorList = FavoritesStore::ColorList;

namespace {

constexpr std::size_t mostValuesPutAside = 16;

/** None when the value is not a list of colors in its present form. */
std::optional<ColorList> decoded(const DefaultsValue &value)
{
    const auto *bytes = std::get_if<Bytes>(&value);
    if (!bytes)
        return std::nullopt;
    auto colors = model::decodedColors(std::string(bytes->begin(), bytes->end()));
    if (auto *list = std::get_if<ColorList>(&colors))
        return std::move(*list);
    return std::nullopt;
}

// An older form, an array with one archived color each, is not decoded: the archives are those of another platform, and
// there is nothing here that could open them. They read as an empty list, and are put aside when the list is saved.
ColorList listIn(const std::optional<DefaultsValue> &stored)
{
    return stored ? decoded(*stored).value_or(ColorList()) : ColorList();
}

std::optional<Bytes> encoded(const ColorList &colors)
{
    const auto json = model::encodedColors(colors);
    const auto *text = std::get_if<std::string>(&json);
    return text ? std::optional(Bytes(text->begin(), text->end())) : std::nullopt;
}

/** Whether something is stored that may be favorites, readable or not. */
bool holdsFavorites(const std::optional<DefaultsValue> &stored)
{
    return stored && (std::holds_alternative<Bytes>(*stored) || std::holds_alternative<DefaultsArray>(*stored));
}

} // namespace

FavoritesStore::FavoritesStore(platform::UserDefaults &defaults) : m_defaults(defaults)
{
    if (!holdsFavorites(m_defaults.value(favoriteColorsUserDefaultsKey)))
        writeDefaultFavorites();
}

ColorList FavoritesStore::loadFavoriteColors() const
{
    return listIn(m_defaults.value(favoriteColorsUserDefaultsKey));
}

ColorList FavoritesStore::favoriteColors(bool includingAlpha) const
{
    auto colors = loadFavoriteColors();
    return includingAlpha ? colors : opaqueColors(colors);
}

void FavoritesStore::writeDefaultFavorites()
{
    rewrite([](const StoredValue &stored) -> std::optional<ColorList> {
        // Asked again: another picker may have been quicker.
        if (holdsFavorites(stored))
            return std::nullopt;
        return defaultFavorites(model::deviceDefaultColorSpace());
    });
}

void FavoritesStore::saveFavoriteColors(const ColorList &colors, bool replacingAll)
{
    rewrite([&](const StoredValue &stored) -> std::optional<ColorList> {
        return replacingAll ? colors : mergedFavorites(listIn(stored), colors);
    });
}

void FavoritesStore::rewrite(const Edit &edit)
{
    StoredValue putAsideValue;
    // A value that cannot be read stops the first attempt; it is put aside and the second attempt overwrites it.
    for (int attempt = 0; attempt < 2; ++attempt) {
        StoredValue unreadable;
        m_defaults.update(favoriteColorsUserDefaultsKey, [&](const StoredValue &stored) -> StoredValue {
            unreadable.reset();
            const auto colors = edit(stored);
            const auto bytes = colors ? encoded(*colors) : std::nullopt;
            if (!bytes)
                return stored;
            if (stored && !decoded(*stored) && stored != putAsideValue) {
                unreadable = stored;
                return stored;
            }
            return *bytes;
        });
        if (!unreadable || !putAside(*unreadable))
            return;
        putAsideValue = std::move(unreadable);
    }
}

bool FavoritesStore::putAside(const DefaultsValue &value)
{
    const bool kept = m_defaults.update(undecodableUserDefaultsKey, [&](const StoredValue &stored) -> StoredValue {
        const auto *array = stored ? std::get_if<DefaultsArray>(&*stored) : nullptr;
        DefaultsArray values = array ? *array : DefaultsArray();
        if (std::ranges::find(values, value) != values.end())
            return stored;
        values.push_back(value);
        if (values.size() > mostValuesPutAside)
            values.erase(values.begin());
        return values;
    });
    colorPickerLog().warning(kept ? "The stored favorites cannot be read; they were put aside and the list starts anew"
                                  : "The stored favorites can neither be read nor put aside; new ones are not saved");
    return kept;
}

} // namespace favrin::service
