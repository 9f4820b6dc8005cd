// What the keyboard does to the strip.

#include "favorites/favoritecolorpickerview.h"

#include "favorites/favoritecolorwellcell.h"
#include "favorites/stripkeys.h"

#include <QKeyEvent>

#include <algorithm>

namespace favrin::favorites {

std::optional<int> FavoriteColorPickerView::focusedPlace() const
{
    return m_focusedItem.isValid() ? std::optional(m_focusedItem.row()) : std::nullopt;
}

QRectF FavoriteColorPickerView::focusFrame() const
{
    const auto place = focusedPlace();
    return place && collectionView() ? collectionView()->frame(*place) : QRectF();
}

/** Where the keyboard is; on another page than the shown one it does not stay. */
std::optional<int> FavoriteColorPickerView::placeForKeys()
{
    const auto *cells = collectionView();
    if (!cells || cells->itemCount() == 0)
        return std::nullopt;
    const auto focused = focusedPlace();
    if (focused && cells->pageLayout().pageOf(*focused) == shownPage())
        return focused;
    return startingPlace(m_coordinator->dataSource().items(), cells->pageLayout(), shownPage(),
                         cells->selectedPlaces());
}

void FavoriteColorPickerView::setFocusedPlace(int place)
{
    m_focusedPlace = place;
    m_focusedItem = m_coordinator->dataSource().index(place);
    Q_EMIT focusFrameChanged();
}

void FavoriteColorPickerView::moveFocus(int place)
{
    setFocusedPlace(place);
    const PageLayout &layout = collectionView()->pageLayout();
    if (const int page = layout.pageOf(place); page != shownPage())
        scrollTo(layout.offsetOf(page), Animation::Animated);
}

void FavoriteColorPickerView::keepFocus()
{
    if (m_focusedItem.isValid())
        m_focusedPlace = m_focusedItem.row();
    else if (const int items = collectionView()->itemCount(); m_focusVisible && items > 0)
        setFocusedPlace(std::min(m_focusedPlace, items - 1));
    Q_EMIT focusFrameChanged();
}

void FavoriteColorPickerView::keyPressEvent(QKeyEvent *event)
{
    const auto place = placeForKeys();
    if (!place || event->modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier)) {
        event->ignore();
        return;
    }
    if (handleCommandKey(*event, *place)) {
        setFocusVisible(true);
        return;
    }
    const auto &items = m_coordinator->dataSource().items();
    const auto target =
        placeForKey(event->key(), items, collectionView()->pageLayout(), *place, collectionView()->layoutDirection());
    if (!target) {
        event->ignore();
        return;
    }
    setFocusVisible(true);
    moveFocus(*target);
}

bool FavoriteColorPickerView::handleCommandKey(const QKeyEvent &event, int place)
{
    const bool shift = event.modifiers().testFlag(Qt::ShiftModifier);
    switch (event.key()) {
    case Qt::Key_Space:
    case Qt::Key_Return:
    case Qt::Key_Enter:
        setFocusedPlace(place);
        m_coordinator->selectItem(place);
        return true;
    case Qt::Key_Delete:
        setFocusedPlace(place);
        if (auto *cell = m_coordinator->cellForDeleteCallout(place))
            cell->performDelete();
        return true;
    case Qt::Key_Menu:
        return presentDeleteCallout(place);
    case Qt::Key_F10:
        return shift && presentDeleteCallout(place);
    default:
        return false;
    }
}

void FavoriteColorPickerView::focusInEvent(QFocusEvent *event)
{
    const auto reason = event->reason();
    if (reason == Qt::ActiveWindowFocusReason || reason == Qt::PopupFocusReason)
        return;
    const bool byKey =
        reason == Qt::TabFocusReason || reason == Qt::BacktabFocusReason || reason == Qt::ShortcutFocusReason;
    if (byKey) {
        if (const auto place = placeForKeys())
            setFocusedPlace(*place);
    }
    setFocusVisible(byKey);
}

void FavoriteColorPickerView::focusOutEvent(QFocusEvent *event)
{
    if (event->reason() != Qt::ActiveWindowFocusReason && event->reason() != Qt::PopupFocusReason)
        setFocusVisible(false);
}

void FavoriteColorPickerView::setFocusVisible(bool visible)
{
    if (visible == m_focusVisible)
        return;
    m_focusVisible = visible;
    Q_EMIT focusFrameChanged();
}

} // namespace favrin::favorites
