#include "favorites/favoritecolorpickerview.h"

#include "favorites/accessiblefavorites.h"
#include "favorites/favoritecolorwellcell.h"
#include "platform/queue/queue.h"
#include "theme/theme.h"

#include <QQuickWindow>

#include <algorithm>
#include <cmath>

namespace favrin::favorites {

using service::ColorPickerState;
using theme::Theme;

FavoriteColorPickerView::FavoriteColorPickerView(QQuickItem *parent)
    : QQuickItem(parent), m_coordinator(std::make_unique<Coordinator>(*this))
{
    installAccessibleFavorites();
    setActiveFocusOnTab(true);
    connect(&Theme::instance(), &Theme::layoutDirectionChanged, this, &FavoriteColorPickerView::updateDirection);
}

FavoriteColorPickerView::~FavoriteColorPickerView() = default;

void FavoriteColorPickerView::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state) {
        for (const auto change : {&ColorPickerState::selectedColorChanged, &ColorPickerState::allowsNoColorChanged,
                                  &ColorPickerState::favoriteColorsChanged, &ColorPickerState::suggestedColorsChanged,
                                  &ColorPickerState::useLandscapeLayoutChanged})
            connect(state, change, this, &FavoriteColorPickerView::setNeedsUpdate);
    }
    setNeedsUpdate();
    Q_EMIT colorPickerStateChanged();
}

void FavoriteColorPickerView::setModel(Model *model)
{
    if (model == m_model)
        return;
    if (m_model)
        m_model->disconnect(this);
    m_model = model;
    if (model) {
        connect(model, &Model::pageControlPendingPageChanged, this, [this] {
            if (m_model->pageControlPendingPage())
                setNeedsUpdate();
        });
    }
    setNeedsUpdate();
    Q_EMIT modelChanged();
}

void FavoriteColorPickerView::setSwatchesPerPage(int swatchesPerPage)
{
    swatchesPerPage = std::max(swatchesPerPage, 2);
    if (swatchesPerPage == m_swatchesPerPage)
        return;
    m_swatchesPerPage = swatchesPerPage;
    setNeedsUpdate();
    Q_EMIT swatchesPerPageChanged();
}

void FavoriteColorPickerView::setCollectionView(FavoritesCollectionView *collectionView)
{
    if (collectionView == m_coordinator->collectionView())
        return;
    m_coordinator->setCollectionView(m_state ? collectionView : nullptr);
    if (isComponentComplete()) {
        updateDirection();
        setNeedsUpdate();
    }
    Q_EMIT collectionViewChanged();
}

void FavoriteColorPickerView::componentComplete()
{
    QQuickItem::componentComplete();
    updateDirection();
    updateNow();
}

bool FavoriteColorPickerView::isShown() const
{
    return window() && window()->isVisible();
}

void FavoriteColorPickerView::setNeedsUpdate()
{
    if (!isComponentComplete() || m_updateIsPending)
        return;
    if (!isShown()) {
        updateNow();
        return;
    }
    m_updateIsPending = true;
    platform::mainQueue().async([weak = QPointer(this)] {
        if (!weak)
            return;
        weak->m_updateIsPending = false;
        weak->updateNow();
    });
}

void FavoriteColorPickerView::updateNow()
{
    if (m_state && m_model)
        m_coordinator->update();
}

double FavoriteColorPickerView::contentWidth() const
{
    const auto *cells = collectionView();
    return cells ? cells->pageLayout().contentWidth(cells->itemCount()) : 0.0;
}

double FavoriteColorPickerView::pageWidth() const
{
    const auto *cells = collectionView();
    return cells ? cells->pageLayout().pageSize().width() : 0.0;
}

double FavoriteColorPickerView::mirroredIfNeeded(double offset) const
{
    const bool mirrored = collectionView()->layoutDirection() == Qt::RightToLeft;
    return mirrored ? contentWidth() - pageWidth() - offset : offset;
}

int FavoriteColorPickerView::shownPage() const
{
    const auto *cells = collectionView();
    return cells->pageLayout().pageAt(m_scrollTarget.value_or(cells->offset()), cells->itemCount());
}

void FavoriteColorPickerView::updateDirection()
{
    auto *cells = collectionView();
    if (!cells || !isComponentComplete())
        return;
    const double offset = cells->offset();
    cells->setLayoutDirection(Theme::instance().layoutDirection());
    scrollTo(offset, Animation::Immediate);
}

void FavoriteColorPickerView::contentChanged()
{
    auto *cells = collectionView();
    const PageLayout &layout = cells->pageLayout();
    const double last = layout.offsetOf(std::max(layout.pageCount(cells->itemCount()) - 1, 0));
    const double offset = std::min(m_scrollTarget.value_or(cells->offset()), last);
    m_isAdjusting = true;
    Q_EMIT contentWidthChanged();
    m_isAdjusting = false;
    // Only where the content does not lie right: a drag that is going on is not to be disturbed.
    const bool mirrored = cells->layoutDirection() == Qt::RightToLeft;
    if (mirrored || offset != m_scrollTarget.value_or(cells->offset()))
        scrollTo(offset, Animation::Immediate);
    keepFocus();
}

void FavoriteColorPickerView::scrollTo(double offset, Animation animation)
{
    const bool animated = animation == Animation::Animated && !Theme::instance().reduceMotion();
    m_scrollTarget = animated ? std::optional(offset) : std::nullopt;
    Q_EMIT scrollRequested(mirroredIfNeeded(offset), animated);
    if (animated)
        return;
    collectionView()->setOffset(offset);
    m_coordinator->trackPage();
}

void FavoriteColorPickerView::didScroll(double contentX)
{
    auto *cells = collectionView();
    if (m_isAdjusting || !isComponentComplete() || !cells || !m_model)
        return;
    const double offset = mirroredIfNeeded(contentX);
    cells->setOffset(offset);
    if (m_scrollTarget && std::abs(offset - *m_scrollTarget) < 0.5)
        m_scrollTarget.reset();
    m_coordinator->trackPage();
}

void FavoriteColorPickerView::movementStarted()
{
    m_movementStartPage = shownPage();
    m_scrollTarget.reset();
}

double FavoriteColorPickerView::restingPosition(double velocity) const
{
    const auto *cells = collectionView();
    const double along = cells->layoutDirection() == Qt::RightToLeft ? -velocity : velocity;
    const PageLayout &layout = cells->pageLayout();
    const int page = layout.restingPage(cells->offset(), along, m_movementStartPage, cells->itemCount());
    return mirroredIfNeeded(layout.offsetOf(page));
}

void FavoriteColorPickerView::tap(QPointF point)
{
    const auto place = collectionView()->placeAt(point);
    if (!place)
        return;
    forceActiveFocus(Qt::MouseFocusReason);
    setFocusVisible(false);
    setFocusedPlace(*place);
    m_coordinator->selectItem(*place);
}

void FavoriteColorPickerView::showDeleteCallout(QPointF point)
{
    if (const auto place = collectionView()->placeAt(point))
        presentDeleteCallout(*place);
}

bool FavoriteColorPickerView::presentDeleteCallout(int place)
{
    m_calloutCell = m_coordinator->cellForDeleteCallout(place);
    if (!m_calloutCell || !m_calloutCell->canDelete())
        return false;
    setFocusedPlace(place);
    Q_EMIT deleteCalloutRequested(collectionView()->frame(place));
    return true;
}

void FavoriteColorPickerView::performDelete()
{
    if (m_calloutCell)
        m_calloutCell->performDelete();
}

} // namespace favrin::favorites
