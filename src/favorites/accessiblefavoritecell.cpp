#include "favorites/accessiblefavoritecell.h"

#include "favorites/favoritecolorpickerview.h"
#include "favorites/favoritecolorwellcell.h"
#include "favorites/favoritesstrings.h"

#include <QKeySequence>

namespace favrin::favorites {

AccessibleFavoriteCell::AccessibleFavoriteCell(FavoriteCell *cell) : AccessibleItem(cell) {}

QString AccessibleFavoriteCell::deleteAction()
{
    return QStringLiteral("Delete");
}

FavoriteColorPickerView *AccessibleFavoriteCell::view() const
{
    for (QQuickItem *item = cell()->parentItem(); item; item = item->parentItem()) {
        if (auto *view = qobject_cast<FavoriteColorPickerView *>(item))
            return view;
    }
    return nullptr;
}

/** None for a cell that is just leaving. */
std::optional<int> AccessibleFavoriteCell::place() const
{
    const auto *strip = view();
    return strip && strip->collectionView() ? strip->collectionView()->placeOf(cell()) : std::nullopt;
}

bool AccessibleFavoriteCell::canDelete() const
{
    const auto *swatch = qobject_cast<FavoriteColorWellCell *>(cell());
    return swatch && swatch->canDelete();
}

QAccessibleInterface *AccessibleFavoriteCell::parent() const
{
    return QAccessible::queryAccessibleInterface(view());
}

QString AccessibleFavoriteCell::text(QAccessible::Text kind) const
{
    return kind == QAccessible::Name ? cell()->accessibilityLabel() : QString();
}

QAccessible::State AccessibleFavoriteCell::state() const
{
    QAccessible::State state = AccessibleItem::state();
    state.selectable = cell()->saysSelected();
    state.selected = cell()->saysSelected() && cell()->isSelected();
    const auto *strip = view();
    state.focused = strip && strip->hasActiveFocus() && place() && place() == strip->focusedPlace();
    return state;
}

void *AccessibleFavoriteCell::interface_cast(QAccessible::InterfaceType type)
{
    return type == QAccessible::ActionInterface ? static_cast<QAccessibleActionInterface *>(this) : nullptr;
}

QStringList AccessibleFavoriteCell::actionNames() const
{
    return canDelete() ? QStringList{pressAction(), deleteAction()} : QStringList{pressAction()};
}

QString AccessibleFavoriteCell::localizedActionName(const QString &name) const
{
    return name == deleteAction() ? FavoritesStrings::deleteCommand()
                                  : QAccessibleActionInterface::localizedActionName(name);
}

void AccessibleFavoriteCell::doAction(const QString &actionName)
{
    auto *strip = view();
    const auto pressed = place();
    if (!strip || !pressed || !strip->isEnabled())
        return;
    if (actionName == pressAction())
        strip->coordinator().selectItem(*pressed);
    else if (actionName == deleteAction() && canDelete())
        static_cast<FavoriteColorWellCell *>(cell())->performDelete();
}

QStringList AccessibleFavoriteCell::keyBindingsForAction(const QString &actionName) const
{
    if (actionName != deleteAction())
        return {};
    return {QKeySequence(Qt::Key_Delete).toString(QKeySequence::NativeText)};
}

} // namespace favrin::favorites
