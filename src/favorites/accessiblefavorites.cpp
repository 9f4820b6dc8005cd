#include "favorites/accessiblefavorites.h"

#include "favorites/accessiblefavoritecell.h"
#include "favorites/favoritecolorpickerview.h"
#include "favorites/favoritesstrings.h"
#include "platform/accessibility/accessibleitem.h"
#include "platform/accessibility/screenrect.h"

#include <algorithm>

namespace favrin::favorites {
namespace {

class AccessibleFavorites : public platform::AccessibleItem
{
public:
    explicit AccessibleFavorites(FavoriteColorPickerView *view) : AccessibleItem(view)
    {
        // This object exists only where somebody asked for it, so there is somebody to hear.
        QObject::connect(view, &FavoriteColorPickerView::focusFrameChanged, &m_context, [this] { announceFocus(); });
        // It may be asked for before the strip has its cells.
        QObject::connect(view, &FavoriteColorPickerView::collectionViewChanged, &m_context, [this] { followCells(); });
        followCells();
    }

    int childCount() const override { return static_cast<int>(elements().size()); }

    QAccessibleInterface *child(int index) const override
    {
        const auto cells = elements();
        if (index < 0 || index >= static_cast<int>(cells.size()))
            return nullptr;
        return QAccessible::queryAccessibleInterface(cells[static_cast<std::size_t>(index)]);
    }

    int indexOfChild(const QAccessibleInterface *child) const override
    {
        const auto cells = elements();
        const auto found = std::ranges::find(cells, child->object());
        return found != cells.end() ? static_cast<int>(found - cells.begin()) : -1;
    }

    QAccessibleInterface *childAt(int x, int y) const override
    {
        const auto cells = elements();
        const auto found = std::ranges::find_if(
            cells, [x, y](const FavoriteCell *cell) { return platform::screenRect(*cell).contains(x, y); });
        return found != cells.end() ? QAccessible::queryAccessibleInterface(*found) : nullptr;
    }

    QAccessibleInterface *focusChild() const override
    {
        const auto place = view()->focusedPlace();
        auto *cell = view()->hasActiveFocus() && place ? view()->collectionView()->cellAt(*place) : nullptr;
        return cell && cell->isAccessibilityElement() ? QAccessible::queryAccessibleInterface(cell) : nullptr;
    }

    QString text(QAccessible::Text kind) const override
    {
        return kind == QAccessible::Name ? FavoritesStrings::favorites() : QString();
    }

    QAccessible::Role role() const override { return QAccessible::List; }

    QAccessible::State state() const override
    {
        QAccessible::State state = AccessibleItem::state();
        state.multiSelectable = true;
        return state;
    }

private:
    FavoriteColorPickerView *view() const { return static_cast<FavoriteColorPickerView *>(item()); }

    std::vector<FavoriteCell *> elements() const
    {
        auto cells = view()->collectionView() ? view()->collectionView()->cells() : std::vector<FavoriteCell *>();
        std::erase_if(cells, [](const FavoriteCell *cell) { return !cell->isAccessibilityElement(); });
        return cells;
    }

    void followCells()
    {
        if (auto *cells = view()->collectionView())
            QObject::connect(cells, &FavoritesCollectionView::selectionChanged, &m_context, announceSelection);
    }

    static void announceSelection(FavoriteCell *cell)
    {
        QAccessibleEvent event(cell, QAccessible::Selection);
        QAccessible::updateAccessibility(&event);
    }

    void announceFocus() const
    {
        if (QAccessibleInterface *cell = focusChild()) {
            QAccessibleEvent event(cell, QAccessible::Focus);
            QAccessible::updateAccessibility(&event);
        }
    }

    QObject m_context;
};

QAccessibleInterface *makeAccessible(const QString &, QObject *object)
{
    if (auto *view = qobject_cast<FavoriteColorPickerView *>(object))
        return new AccessibleFavorites(view);
    if (auto *cell = qobject_cast<FavoriteCell *>(object))
        return new AccessibleFavoriteCell(cell);
    return nullptr;
}

} // namespace

void installAccessibleFavorites()
{
    // Installing the same factory again replaces nothing and adds nothing.
    QAccessible::installFactory(makeAccessible);
}

} // namespace favrin::favorites
