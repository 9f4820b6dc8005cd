#include "favorites/favoritecolorpickercoordinator.h"

#include "favorites/addcolorcell.h"
#include "favorites/favoritecolorpickerview.h"
#include "favorites/favoritecolorwellcell.h"
#include "favorites/removecolorcell.h"
#include "platform/queue/queue.h"

#include <algorithm>

namespace favrin::favorites {

using model::SomeColor;
using Kind = ColorItem::Kind;

FavoriteColorPickerCoordinator::FavoriteColorPickerCoordinator(FavoriteColorPickerView &parent) : m_parent(parent) {}

FavoriteColorPickerCoordinator::~FavoriteColorPickerCoordinator()
{
    setCollectionView(nullptr);
}

service::ColorPickerState &FavoriteColorPickerCoordinator::state() const
{
    return *m_parent.colorPickerState();
}

void FavoriteColorPickerCoordinator::setCollectionView(FavoritesCollectionView *collectionView)
{
    if (m_collectionView)
        m_collectionView->setDataSource(nullptr, nullptr);
    m_collectionView = collectionView;
    if (!collectionView)
        return;
    applyList(Animation::Immediate);
    record();
    collectionView->setDataSource(&m_dataSource, [this](const ColorItem &item) { return makeCell(item); });
}

bool FavoriteColorPickerCoordinator::mustRebuild() const
{
    return m_selectedColor != state().selectedColor() || m_allowsNoColor != state().allowsNoColor() ||
           m_appliedFavoriteColors != state().favoriteColors() ||
           m_appliedSwatchesPerPage != m_parent.swatchesPerPage() ||
           m_appliedSuggestedColors != state().suggestedColors();
}

void FavoriteColorPickerCoordinator::applyList(Animation animation)
{
    m_dataSource.apply(itemList(state(), m_parent.swatchesPerPage(), m_parent.deletedIndexes()), animation);
}

void FavoriteColorPickerCoordinator::record()
{
    m_selectedColor = state().selectedColor();
    m_allowsNoColor = state().allowsNoColor();
    m_appliedFavoriteColors = state().favoriteColors();
    m_appliedSwatchesPerPage = m_parent.swatchesPerPage();
    m_appliedSuggestedColors = state().suggestedColors();
}

void FavoriteColorPickerCoordinator::update()
{
    if (!m_collectionView)
        return;
    if (mustRebuild()) {
        applyList(m_isEditing ? Animation::Animated : Animation::Immediate);
        record();
    }
    applyLayout();
    synchronizeSelection();
    m_isEditing = false;
    m_parent.contentChanged();
    scrollToPendingPage();
    publishPages();
}

void FavoriteColorPickerCoordinator::applyLayout()
{
    const PageLayout layout(swatchMetrics(state().useLandscapeLayout()), m_parent.swatchesPerPage());
    const PageLayout &old = m_collectionView->pageLayout();
    if (layout == old)
        return;
    // What came first on the page is on the page that is shown afterwards.
    const int first = old.pageAt(m_collectionView->offset(), m_collectionView->itemCount()) * old.swatchesPerPage();
    m_collectionView->setPageLayout(layout);
    m_parent.scrollTo(layout.offsetOf(layout.pageOf(first)), Animation::Immediate);
}

void FavoriteColorPickerCoordinator::synchronizeSelection()
{
    m_collectionView->setSelectedPlaces(selectedPlaces(m_dataSource.items(), state().selectedColor()));
}

void FavoriteColorPickerCoordinator::scrollToPendingPage()
{
    const auto page = m_parent.model()->pageControlPendingPage();
    const int items = m_collectionView->itemCount();
    if (!page || items == 0)
        return;
    const PageLayout &layout = m_collectionView->pageLayout();
    const int shown = std::clamp(*page, 0, layout.pageCount(items) - 1);
    m_parent.scrollTo(layout.offsetOf(shown), Animation::Immediate);
}

void FavoriteColorPickerCoordinator::publishPages()
{
    const auto handledPage = m_parent.model()->pageControlPendingPage();
    const auto publish = [this, handledPage] {
        auto &model = *m_parent.model();
        const int swatchesPerPage = m_parent.swatchesPerPage();
        const int pages = (m_dataSource.rowCount() + swatchesPerPage - 1) / swatchesPerPage;
        if (model.numberOfPages() != pages)
            model.numberOfPages.set(pages);
        // Another one that the user asks for meanwhile is still to come.
        if (handledPage && model.pageControlPendingPage() == handledPage)
            model.pageControlPendingPage.set(std::nullopt);
    };
    publishInLaterTurn(publish);
}

void FavoriteColorPickerCoordinator::trackPage()
{
    if (shownPage() == m_parent.model()->currentPage())
        return;
    publishInLaterTurn([this] {
        if (const int page = shownPage(); page != m_parent.model()->currentPage())
            m_parent.model()->currentPage.set(page);
    });
}

int FavoriteColorPickerCoordinator::shownPage() const
{
    const auto *cells = m_collectionView.data();
    return cells ? cells->pageLayout().pageAt(cells->offset(), cells->itemCount()) : 0;
}

void FavoriteColorPickerCoordinator::publishInLaterTurn(std::function<void()> publish)
{
    // What depends on the pages, the picker's height too, is to be right in the first frame already.
    if (!m_parent.isShown()) {
        publish();
        return;
    }
    platform::mainQueue().async([weak = std::weak_ptr<bool>(m_alive), this, publish = std::move(publish)] {
        if (!weak.expired() && m_parent.model() && m_parent.colorPickerState())
            publish();
    });
}

void FavoriteColorPickerCoordinator::selectItem(int place)
{
    const ColorItem *item = m_dataSource.item(place);
    if (!item)
        return;
    switch (item->kind) {
    case Kind::suggestedColor:
    case Kind::color:
        state().setColorBinding(*item->color);
        break;
    case Kind::filler:
        break;
    case Kind::addButton:
        addSelectedColor();
        break;
    case Kind::removeButton:
        removeSelectedColor();
        break;
    }
}

void FavoriteColorPickerCoordinator::addSelectedColor()
{
    m_isEditing = true;
    if (!state().selectedColor())
        return;
    auto colors = state().favoriteColors();
    colors.push_back(*state().selectedColor());
    state().favoriteColors.set(std::move(colors));
}

void FavoriteColorPickerCoordinator::removeSelectedColor()
{
    const auto space = state().colorBinding().colorSpace;
    state().fallbackColor.set(SomeColor(platform::Color::black(), space));
    state().selectedColor.set(std::nullopt);
}

FavoriteColorWellCell *FavoriteColorPickerCoordinator::cellForDeleteCallout(int place) const
{
    const ColorItem *item = m_dataSource.item(place);
    if (!item || item->kind != Kind::color || !m_collectionView)
        return nullptr;
    return qobject_cast<FavoriteColorWellCell *>(m_collectionView->cellAt(place));
}

void FavoriteColorPickerCoordinator::deleteItem(const ColorItem &item)
{
    if (item.kind != Kind::color)
        return;
    // The item may belong to the very cell that is deleted.
    const ColorItem deleted = item;
    m_parent.deletedIndexes()[*deleted.color].insert(deleted.number);
    const auto place = favoritePlace(m_dataSource.items(), deleted);
    auto colors = state().favoriteColors();
    if (!place || *place >= colors.size())
        return;
    colors.erase(colors.begin() + static_cast<std::ptrdiff_t>(*place));
    state().favoriteColors.set(std::move(colors));
}

std::unique_ptr<FavoriteCell> FavoriteColorPickerCoordinator::makeCell(const ColorItem &item)
{
    switch (item.kind) {
    case Kind::filler:
        return std::make_unique<FillerCell>();
    case Kind::addButton:
        return std::make_unique<AddColorCell>();
    case Kind::removeButton:
        return std::make_unique<RemoveColorCell>();
    case Kind::suggestedColor:
    case Kind::color:
        break;
    }
    auto cell = std::make_unique<FavoriteColorWellCell>();
    cell->setColor(item.color->platformColor());
    if (item.kind == Kind::color) {
        cell->setOnDelete([this, item] {
            m_isEditing = true;
            deleteItem(item);
        });
    }
    return cell;
}

} // namespace favrin::favorites
