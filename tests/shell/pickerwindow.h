#pragma once

#include "favorites/favoritecolorpickerview.h"
#include "grid/colorswatchpickerview.h"
#include "shell/colorpickerviewfactory.h"
#include "shell/colorwell.h"
#include "spectrum/spectrum.h"
#include "theme/theme.h"

#include <QAccessible>
#include <QQmlEngine>
#include <QQuickWindow>
#include <QTest>

#include <functional>
#include <optional>

/** The root view in a window of 360 × 640 points, or as large as wanted. */
class PickerWindow
{
public:
    /** @param prepare gives the state what it has before there is a view */
    explicit PickerWindow(QSize size = QSize(360, 640), std::vector<favrin::model::SomeColor> favorites = {},
                          const std::function<void(favrin::service::ColorPickerState &)> &prepare = {})
        : state(std::move(favorites))
    {
        if (prepare)
            prepare(state);
        state.size.set(size);
        state.close.set([this] { ++closed; });
        view = factory.create(state);
        if (!view)
            return;
        view->setParentItem(window.contentItem());
        view->setSize(size);
        view->setFocus(true);
        window.resize(size);
        window.show();
        window.requestActivate();
    }

    bool isReady() { return view && QTest::qWaitForWindowActive(&window); }

    favrin::grid::ColorSwatchPickerView *grid() const { return itemOf<favrin::grid::ColorSwatchPickerView>(); }
    /** Null until its tab was shown. */
    favrin::spectrum::Spectrum *spectrum() const { return itemOf<favrin::spectrum::Spectrum>(); }

    template<class Item>
    Item *itemOf() const
    {
        return itemBelow<Item>(view.get());
    }

    /** Whatever is made later is a child in the scene only. */
    template<class Item>
    static Item *itemBelow(QQuickItem *root)
    {
        const QList<QQuickItem *> children = root->childItems();
        for (QQuickItem *child : children) {
            auto *item = qobject_cast<Item *>(child);
            if (item || (item = itemBelow<Item>(child)))
                return item;
        }
        return nullptr;
    }

    /** The first item below the root that assistive technologies call @p name. */
    QAccessibleInterface *accessible(const QString &name) const { return accessibleBelow(view.get(), name); }

    static QAccessibleInterface *accessibleBelow(const QQuickItem *root, const QString &name,
                                                 std::optional<QAccessible::Role> role = {})
    {
        const QList<QQuickItem *> children = root->childItems();
        for (QQuickItem *child : children) {
            QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(child);
            if (interface && interface->text(QAccessible::Name) == name &&
                interface->role() == role.value_or(interface->role()))
                return interface;
            if ((interface = accessibleBelow(child, name, role)))
                return interface;
        }
        return nullptr;
    }

    QQuickItem *editableItem(const QString &name) const
    {
        QAccessibleInterface *interface = accessibleBelow(view.get(), name, QAccessible::EditableText);
        return interface ? qobject_cast<QQuickItem *>(interface->object()) : nullptr;
    }

    QQuickItem *item(const QString &name) const
    {
        QAccessibleInterface *interface = accessible(name);
        return interface ? qobject_cast<QQuickItem *>(interface->object()) : nullptr;
    }

    static QRectF inWindow(const QQuickItem *item) { return item->mapRectToScene(item->boundingRect()); }

    favrin::service::ColorPickerState state;
    int closed = 0;
    QQmlEngine engine;
    favrin::shell::ColorPickerViewFactory factory = favrin::shell::ColorPickerViewFactory(engine);
    QQuickWindow window;
    std::unique_ptr<QQuickItem> view;
};
