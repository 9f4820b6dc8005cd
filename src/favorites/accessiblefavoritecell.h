#pragma once

#include "favorites/favoritecell.h"

#include <QAccessibleObject>

namespace favrin::favorites {

class FavoriteColorPickerView;

/** One cell as assistive technologies see it: a button, which deletes too where the color can be deleted. */
class AccessibleFavoriteCell : public QAccessibleObject, public QAccessibleActionInterface
{
public:
    explicit AccessibleFavoriteCell(FavoriteCell *cell);

    /** The name of the delete action. */
    static QString deleteAction();

    QWindow *window() const override;
    QAccessibleInterface *parent() const override;
    QAccessibleInterface *child(int) const override { return nullptr; }
    int childCount() const override { return 0; }
    int indexOfChild(const QAccessibleInterface *) const override { return -1; }
    QString text(QAccessible::Text kind) const override;
    QRect rect() const override;
    QAccessible::Role role() const override { return QAccessible::Button; }
    QAccessible::State state() const override;
    void *interface_cast(QAccessible::InterfaceType type) override;

    QStringList actionNames() const override;
    QString localizedActionName(const QString &name) const override;
    void doAction(const QString &actionName) override;
    QStringList keyBindingsForAction(const QString &actionName) const override;

private:
    FavoriteCell *cell() const { return static_cast<FavoriteCell *>(object()); }
    FavoriteColorPickerView *view() const;
    std::optional<int> place() const;
    bool canDelete() const;
};

/** The area of an item in the coordinates of the screen. */
QRect screenRect(const QQuickItem &item);

} // namespace favrin::favorites
