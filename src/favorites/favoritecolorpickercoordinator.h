#pragma once

#include "favorites/favoritecell.h"
#include "favorites/favoritesdatasource.h"
#include "favorites/pagelayout.h"

#include <QPointer>

#include <functional>
#include <memory>

namespace favrin::service {
class ColorPickerState;
}

namespace favrin::favorites {

class FavoriteColorPickerView;
class FavoriteColorWellCell;
class FavoritesCollectionView;

/**
 * What the strip does: it remembers what the collection view shows, brings it up to date with the state, and turns what
 * the user does into writes to the state. Lives as long as the strip is shown. Main thread only.
 */
class FavoriteColorPickerCoordinator
{
public:
    explicit FavoriteColorPickerCoordinator(FavoriteColorPickerView &parent);
    ~FavoriteColorPickerCoordinator();
    FavoriteColorPickerCoordinator(const FavoriteColorPickerCoordinator &) = delete;
    FavoriteColorPickerCoordinator &operator=(const FavoriteColorPickerCoordinator &) = delete;

    /** Shows the state's list in @p collectionView for the first time, and takes care of it from now on. */
    void setCollectionView(FavoritesCollectionView *collectionView);
    FavoritesCollectionView *collectionView() const { return m_collectionView; }
    const FavoritesDataSource &dataSource() const { return m_dataSource; }

    /** Brings the collection view up to date. A change is animated when it comes from an add or a delete. */
    void update();
    /** After scrolling: the page that is shown. */
    void trackPage();

    /** A tap on an item. */
    void selectItem(int place);
    /** The cell whose delete menu a long press at @p place asks for; null when there is nothing to delete. */
    FavoriteColorWellCell *cellForDeleteCallout(int place) const;
    /** Deletes a favorite; does nothing for any other item. */
    void deleteItem(const ColorItem &item);

private:
    service::ColorPickerState &state() const;
    bool mustRebuild() const;
    void applyList(Animation animation);
    void record();
    void applyLayout();
    void synchronizeSelection();
    void scrollToPendingPage();
    int shownPage() const;
    void publishPages();
    void publishInLaterTurn(std::function<void()> publish);
    void addSelectedColor();
    void removeSelectedColor();
    std::unique_ptr<FavoriteCell> makeCell(const ColorItem &item);

    FavoriteColorPickerView &m_parent;
    FavoritesDataSource m_dataSource;
    QPointer<FavoritesCollectionView> m_collectionView;
    // What was applied last.
    std::optional<model::SomeColor> m_selectedColor;
    bool m_allowsNoColor = false;
    std::vector<model::SomeColor> m_appliedFavoriteColors;
    int m_appliedSwatchesPerPage = 0;
    std::optional<std::vector<model::SomeColor>> m_appliedSuggestedColors;
    /** From an add or a delete to the end of the next update, which is then animated. */
    bool m_isEditing = false;
    /** Guards work in later turns against the end of the strip. */
    std::shared_ptr<bool> m_alive = std::make_shared<bool>(true);
};

} // namespace favrin::favorites
