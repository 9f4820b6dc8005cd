#pragma once

#include "favorites/favoritecell.h"
#include "platform/accessibility/accessibleitem.h"

namespace favrin::favorites {

class FavoriteColorPickerView;

/** One cell as assistive technologies see it: a button, which deletes too where the color can be deleted. */
class AccessibleFavoriteCell : public platform::AccessibleItem, public QAccessibleActionInterface
{
public:
    explicit AccessibleFavoriteCell(FavoriteCell *cell);

    /** The name of the delete action. */
    static QString deleteAction();

    QAccessibleInterface *parent() const override;
    QString text(QAccessible::Text kind) const override;
    QAccessible::Role role() const override { return QAccessible::Button; }
    QAccessible::State state() const override;
    void *interface_cast(QAccessible::InterfaceType type) override;

    QStringList actionNames() const override;
    QString localizedActionName(const QString &name) const override;
    void doAction(const QString &actionName) override;
    QStringList keyBindingsForAction(const QString &actionName) const override;

private:
    FavoriteCell *cell() const { return static_cast<FavoriteCell *>(item()); }
    FavoriteColorPickerView *view() const;
    std::optional<int> place() const;
    bool canDelete() const;
};

} // namespace favrin::favorites
