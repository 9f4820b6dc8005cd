#include "favorites/favoritescollectionview.h"

#include <algorithm>

namespace favrin::favorites {

FavoritesCollectionView::FavoritesCollectionView(QQuickItem *parent) : QQuickItem(parent) {}

FavoritesCollectionView::~FavoritesCollectionView() = default;

void FavoritesCollectionView::setDataSource(FavoritesDataSource *dataSource, CellProvider cellProvider)
{
    if (m_dataSource)
        m_dataSource->disconnect(this);
    m_cells.clear();
    m_leavingCells.clear();
    m_dataSource = dataSource;
    m_cellProvider = std::move(cellProvider);
    if (dataSource) {
        connect(dataSource, &FavoritesDataSource::willApply, this, &FavoritesCollectionView::willApply);
        connect(dataSource, &FavoritesDataSource::applied, this, &FavoritesCollectionView::applied);
        connect(dataSource, &FavoritesDataSource::rowsInserted, this, [this](const QModelIndex &, int first, int last) {
            m_insertedPlaces.push_back({first, last - first + 1});
        });
    }
    layOutCells(Reach::Visible);
}

void FavoritesCollectionView::setPageLayout(const PageLayout &layout)
{
    if (layout == m_layout)
        return;
    setTransitionProgress(1.0);
    m_layout = layout;
    layOutCells(Reach::Visible);
}

void FavoritesCollectionView::setLayoutDirection(Qt::LayoutDirection direction)
{
    if (direction == m_direction)
        return;
    m_direction = direction;
    placeCells();
}

void FavoritesCollectionView::setOffset(double offset)
{
    if (offset == m_offset)
        return;
    m_offset = offset;
    layOutCells(m_transitionProgress < 1.0 ? Reach::Neighbourhood : Reach::Visible);
}

int FavoritesCollectionView::itemCount() const
{
    return m_dataSource ? m_dataSource->rowCount() : 0;
}

std::optional<int> FavoritesCollectionView::placeAt(QPointF point) const
{
    if (m_direction == Qt::RightToLeft)
        point.setX(m_layout.contentWidth(itemCount()) - point.x());
    return m_layout.placeAt(point, itemCount());
}

QRectF FavoritesCollectionView::frame(int place) const
{
    const QRectF frame = m_layout.frame(place);
    return {mirroredIfNeeded(frame.topLeft()), frame.size()};
}

FavoriteCell *FavoritesCollectionView::cellAt(int place) const
{
    const auto found = std::ranges::lower_bound(m_cells, place, {}, &ShownCell::place);
    return found != m_cells.end() && found->place() == place ? found->cell.get() : nullptr;
}

std::optional<int> FavoritesCollectionView::placeOf(const FavoriteCell *cell) const
{
    const auto found = std::ranges::find(m_cells, cell, [](const ShownCell &shown) { return shown.cell.get(); });
    return found != m_cells.end() ? std::optional(found->place()) : std::nullopt;
}

std::vector<FavoriteCell *> FavoritesCollectionView::cells() const
{
    std::vector<FavoriteCell *> cells;
    for (const ShownCell &shown : m_cells)
        cells.push_back(shown.cell.get());
    return cells;
}

void FavoritesCollectionView::setSelectedPlaces(std::vector<int> places)
{
    m_selectedPlaces = std::move(places);
    for (const ShownCell &shown : m_cells) {
        const bool selected = std::ranges::binary_search(m_selectedPlaces, shown.place());
        if (selected == shown.cell->isSelected())
            continue;
        shown.cell->setSelected(selected);
        Q_EMIT selectionChanged(shown.cell.get());
    }
}

void FavoritesCollectionView::setTransitionProgress(double progress)
{
    progress = std::clamp(progress, 0.0, 1.0);
    if (progress == m_transitionProgress)
        return;
    m_transitionProgress = progress;
    if (progress < 1.0) {
        placeCells();
    } else {
        m_leavingCells.clear();
        layOutCells(Reach::Visible);
    }
    Q_EMIT transitionProgressChanged();
}

void FavoritesCollectionView::willApply(Animation animation)
{
    m_insertedPlaces.clear();
    if (animation == Animation::Immediate) {
        setTransitionProgress(1.0);
        return;
    }
    m_leavingCells.clear();
    // What moves in from the page before or behind is to be seen coming.
    layOutCells(Reach::Neighbourhood);
    for (ShownCell &shown : m_cells) {
        shown.origin = logicalPosition(shown);
        shown.originOpacity = shown.cell->opacity();
    }
}

void FavoritesCollectionView::applied(Animation animation)
{
    const auto gone = std::stable_partition(m_cells.begin(), m_cells.end(),
                                            [](const ShownCell &shown) { return shown.index.isValid(); });
    if (animation == Animation::Animated)
        std::move(gone, m_cells.end(), std::back_inserter(m_leavingCells));
    m_cells.erase(gone, m_cells.end());
    std::ranges::sort(m_cells, {}, &ShownCell::place);
    if (animation == Animation::Immediate) {
        layOutCells(Reach::Visible);
        return;
    }
    m_transitionProgress = 0.0;
    layOutCells(Reach::Neighbourhood);
    Q_EMIT transitionProgressChanged();
    Q_EMIT transitionStarted();
}

void FavoritesCollectionView::layOutCells(Reach reach)
{
    const auto visible = m_layout.visiblePlaces(m_offset, itemCount());
    const int around = reach == Reach::Neighbourhood ? m_layout.swatchesPerPage() : 0;
    const int first = std::max(visible.first - around, 0);
    const int end = std::min(visible.second + around, itemCount());
    std::erase_if(m_cells, [&](const ShownCell &shown) { return shown.place() < first || shown.place() >= end; });
    addMissingCells({first, end});
    placeCells();
    Q_EMIT cellsChanged();
}

void FavoritesCollectionView::addMissingCells(std::pair<int, int> places)
{
    for (int place = places.first; place < places.second; ++place) {
        const auto position = std::ranges::lower_bound(m_cells, place, {}, &ShownCell::place);
        if (position == m_cells.end() || position->place() != place)
            m_cells.insert(position, makeCell(place));
    }
}

FavoritesCollectionView::ShownCell FavoritesCollectionView::makeCell(int place)
{
    ShownCell shown = {m_dataSource->index(place), m_cellProvider(*m_dataSource->item(place)),
                       m_layout.frame(place).topLeft()};
    shown.originOpacity = isInserted(place) ? 0.0 : 1.0;
    shown.cell->setParentItem(this);
    shown.cell->setSelected(std::ranges::binary_search(m_selectedPlaces, place));
    return shown;
}

bool FavoritesCollectionView::isInserted(int place) const
{
    return std::ranges::any_of(m_insertedPlaces, [place](const PlaceRange &range) {
        return place >= range.first && place < range.first + range.count;
    });
}

void FavoritesCollectionView::placeCells()
{
    const double side = m_layout.metrics().size;
    for (const ShownCell &shown : m_cells) {
        shown.cell->setSize({side, side});
        shown.cell->setPosition(mirroredIfNeeded(logicalPosition(shown)));
        shown.cell->setOpacity(shown.originOpacity + (1.0 - shown.originOpacity) * m_transitionProgress);
    }
    for (const ShownCell &shown : m_leavingCells) {
        shown.cell->setPosition(mirroredIfNeeded(shown.origin));
        shown.cell->setOpacity(shown.originOpacity * (1.0 - m_transitionProgress));
    }
}

QPointF FavoritesCollectionView::logicalPosition(const ShownCell &shown) const
{
    const QPointF target = m_layout.frame(shown.place()).topLeft();
    return m_transitionProgress < 1.0 ? shown.origin + (target - shown.origin) * m_transitionProgress : target;
}

QPointF FavoritesCollectionView::mirroredIfNeeded(QPointF topLeft) const
{
    if (m_direction == Qt::RightToLeft)
        topLeft.setX(m_layout.contentWidth(itemCount()) - m_layout.metrics().size - topLeft.x());
    return topLeft;
}

} // namespace favrin::favorites
