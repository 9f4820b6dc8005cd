#pragma once

#include "grid/gridrules.h"
#include "model/axcolordescription.h"

#include <QAccessibleInterface>
#include <QPointer>

class QQuickItem;

namespace favrin::grid {

class ColorSwatchPickerView;

/** One cell as assistive technologies see it. Named when its name is first asked for. */
class AccessibleSwatch : public QAccessibleInterface, public QAccessibleActionInterface
{
public:
    AccessibleSwatch(ColorSwatchPickerView &view, CellPosition cell);

    CellPosition cell() const { return m_cell; }

    bool isValid() const override;
    QObject *object() const override { return nullptr; }
    QWindow *window() const override;
    QAccessibleInterface *parent() const override;
    QAccessibleInterface *child(int) const override { return nullptr; }
    QAccessibleInterface *childAt(int, int) const override { return nullptr; }
    int childCount() const override { return 0; }
    int indexOfChild(const QAccessibleInterface *) const override { return -1; }
    QString text(QAccessible::Text kind) const override;
    void setText(QAccessible::Text, const QString &) override {}
    QRect rect() const override;
    QAccessible::Role role() const override { return QAccessible::ListItem; }
    QAccessible::State state() const override;
    void *interface_cast(QAccessible::InterfaceType type) override;

    QStringList actionNames() const override;
    void doAction(const QString &actionName) override;
    QStringList keyBindingsForAction(const QString &) const override { return {}; }

private:
    void announceName();

    QPointer<ColorSwatchPickerView> m_view;
    CellPosition m_cell;
    mutable model::AXColorDescription m_description;
};

/** An area of an item in the coordinates of the screen. */
QRect screenRect(const QQuickItem &item, const QRectF &area);

} // namespace favrin::grid
