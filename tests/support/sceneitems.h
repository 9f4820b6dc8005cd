#pragma once

#include <QQuickItem>

/** Every item below @p item, those of menus and other guests too, which have other owners. */
inline QList<QQuickItem *> itemsBelow(const QQuickItem *item)
{
    QList<QQuickItem *> items;
    for (auto *child : item->childItems())
        items << child << itemsBelow(child);
    return items;
}
