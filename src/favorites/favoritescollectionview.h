#pragma once

#include "favorites/favoritecell.h"
#include "favorites/favoritesdatasource.h"
#include "favorites/pagelayout.h"

#include <QPersistentModelIndex>

#include <functional>
#include <memory>

namespace favrin::favorites {

/**
 * The content of the strip: the cells of a data source, laid out in pages. Only cells that can be seen exist, however
 * many items there are.
 *
 * Its own coordinates are those of the scrolled content. Offsets and places run in reading direction, from the right
 * where that is mirrored.
 */
class FavoritesCollectionView : public QQuickItem
{
    Q_OBJECT
    QML_ELEMENT
    /** How far an animated change has got, 0 to 1: whoever hears that one started leads it to 1. */
    Q_PROPERTY(double transitionProgress READ transitionProgress WRITE setTransitionProgress NOTIFY
                   transitionProgressChanged FINAL)

public:
    /** Makes the cell of an item. */
    using CellProvider = std::function<std::unique_ptr<FavoriteCell>(const ColorItem &)>;

    explicit FavoritesCollectionView(QQuickItem *parent = nullptr);
    ~FavoritesCollectionView() override;

    /** The data source must outlive the view, or be set to none before. */
    void setDataSource(FavoritesDataSource *dataSource, CellProvider cellProvider);

    const PageLayout &pageLayout() const { return m_layout; }
    void setPageLayout(const PageLayout &layout);
    Qt::LayoutDirection layoutDirection() const { return m_direction; }
    void setLayoutDirection(Qt::LayoutDirection direction);
    /** How far the content is scrolled. */
    double offset() const { return m_offset; }
    void setOffset(double offset);

    int itemCount() const;
    std::optional<int> placeAt(QPointF point) const;
    QRectF frame(int place) const;
    /** The cell at a place; none where no cell can be seen. */
    FavoriteCell *cellAt(int place) const;
    std::optional<int> placeOf(const FavoriteCell *cell) const;
    /** All cells there are, in the order of their items. */
    std::vector<FavoriteCell *> cells() const;

    /** Increasing. */
    const std::vector<int> &selectedPlaces() const { return m_selectedPlaces; }
    void setSelectedPlaces(std::vector<int> places);

    double transitionProgress() const { return m_transitionProgress; }
    void setTransitionProgress(double progress);

Q_SIGNALS:
    void transitionStarted();
    void transitionProgressChanged();
    /** Cells came or went, or moved to other places. */
    void cellsChanged();
    /** A cell became selected or is so no longer. */
    void selectionChanged(favrin::favorites::FavoriteCell *cell);

private:
    enum class Reach { Visible, Neighbourhood };

    struct ShownCell
    {
        QPersistentModelIndex index;
        std::unique_ptr<FavoriteCell> cell;
        /** Where an animated change found it, and how visible it was there. */
        QPointF origin;
        double originOpacity = 1.0;

        int place() const { return index.row(); }
    };

    void willApply(Animation animation);
    void applied(Animation animation);
    void layOutCells(Reach reach);
    void addMissingCells(std::pair<int, int> places);
    ShownCell makeCell(int place);
    bool isInserted(int place) const;
    void placeCells();
    QPointF logicalPosition(const ShownCell &shown) const;
    QPointF mirroredIfNeeded(QPointF topLeft) const;

    FavoritesDataSource *m_dataSource = nullptr;
    CellProvider m_cellProvider;
    PageLayout m_layout;
    Qt::LayoutDirection m_direction = Qt::LeftToRight;
    double m_offset = 0.0;
    std::vector<int> m_selectedPlaces;
    /** By place. */
    std::vector<ShownCell> m_cells;
    /** Of items that are gone already. */
    std::vector<ShownCell> m_leavingCells;
    std::vector<PlaceRange> m_insertedPlaces;
    double m_transitionProgress = 1.0;
};

} // namespace favrin::favorites
