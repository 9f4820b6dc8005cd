#pragma once

#include "model/somecolor.h"
#include "platform/defaults/userdefaults.h"

#include <functional>
#include <optional>
#include <vector>

namespace favrin::service {

/**
 * The user's favorite colors, kept in the user defaults as a JSON array under one key.
 *
 * Nothing is cached: every load reads the defaults and every save writes them, so that several pickers may be open at
 * once. A value that is no such array reads as an empty list; before it is overwritten it is put aside under a second
 * key, where it stays. Main thread only.
 */
class FavoritesStore
{
public:
    using ColorList = std::vector<model::SomeColor>;

    static constexpr std::string_view favoriteColorsUserDefaultsKey = "FavoriteColors";
    /** An array of the values that were put aside, the latest last; older ones make room beyond sixteen. */
    static constexpr std::string_view undecodableUserDefaultsKey = "FavoriteColors.undecodable";

    /** Stores the default favorites when there are none yet. */
    explicit FavoritesStore(platform::UserDefaults &defaults = platform::UserDefaults::standard());

    /** The stored list, in display order; without alpha only the colors whose opacity is exactly 1. */
    ColorList favoriteColors(bool includingAlpha) const;

    /**
     * Stores a list that the user has edited. When it was shown without alpha it holds the opaque colors only;
     * @p replacingAll is then false and the edit is merged into the stored list. A list with a component that is not
     * finite is not stored.
     */
    void saveFavoriteColors(const ColorList &colors, bool replacingAll);

private:
    using StoredValue = std::optional<platform::DefaultsValue>;
    /** From the stored value to the list to store, or none to leave things as they are. */
    using Edit = std::function<std::optional<ColorList>(const StoredValue &)>;

    ColorList loadFavoriteColors() const;
    void writeDefaultFavorites();
    void rewrite(const Edit &edit);
    bool putAside(const platform::DefaultsValue &value);

    platform::UserDefaults &m_defaults;
};

} // namespace favrin::service
