#pragma once

#include "favorites/listdifference.h"

#include <QAbstractListModel>

namespace favrin::favorites {

/** Whether the change from one list to the next is to be seen happening. */
enum class Animation { Animated, Immediate };

/**
 * The snapshot data source: given whole lists, it tells what goes, moves and comes from one to the next. One section;
 * an item's place is its row. Main thread only.
 */
class FavoritesDataSource : public QAbstractListModel
{
    Q_OBJECT

public:
    enum Role { ItemRole = Qt::UserRole };

    using QAbstractListModel::QAbstractListModel;

    const ItemList &items() const { return m_items; }
    /** The item at a place, or none. */
    const ColorItem *item(int place) const;

    /** Makes @p items the current list. Nothing is said when it is that already. */
    void apply(ItemList items, Animation animation);

    int rowCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;

Q_SIGNALS:
    /** Before the rows of a change go, move and come. */
    void willApply(favrin::favorites::Animation animation);
    /** The list is the new one. */
    void applied(favrin::favorites::Animation animation);

private:
    void remove(PlaceRange range);
    void reorder(const std::vector<int> &order);
    void insert(PlaceRange range, const ItemList &from);

    ItemList m_items;
};

} // namespace favrin::favorites
