#include "favorites/favoritesdatasource.h"

#include <algorithm>
#include <iterator>

namespace favrin::favorites {

const ColorItem *FavoritesDataSource::item(int place) const
{
    return place >= 0 && place < rowCount() ? &m_items[static_cast<std::size_t>(place)] : nullptr;
}

void FavoritesDataSource::apply(ItemList items, Animation animation)
{
    const ListDifference difference = listDifference(m_items, items);
    if (difference.isEmpty())
        return;
    Q_EMIT willApply(animation);
    std::for_each(difference.removals.rbegin(), difference.removals.rend(),
                  [this](const PlaceRange &range) { remove(range); });
    if (!difference.order.empty())
        reorder(difference.order);
    for (const PlaceRange &range : difference.insertions)
        insert(range, items);
    Q_EMIT applied(animation);
}

void FavoritesDataSource::remove(PlaceRange range)
{
    beginRemoveRows({}, range.first, range.first + range.count - 1);
    m_items.erase(m_items.begin() + range.first, m_items.begin() + range.first + range.count);
    endRemoveRows();
}

void FavoritesDataSource::reorder(const std::vector<int> &order)
{
    // One change for all: told move by move, every row would change its place again and again.
    Q_EMIT layoutAboutToBeChanged({}, VerticalSortHint);
    ItemList reordered;
    reordered.reserve(m_items.size());
    QModelIndexList from;
    QModelIndexList to;
    for (const int origin : order) {
        from.append(index(origin));
        to.append(index(static_cast<int>(reordered.size())));
        reordered.push_back(m_items[static_cast<std::size_t>(origin)]);
    }
    m_items = std::move(reordered);
    changePersistentIndexList(from, to);
    Q_EMIT layoutChanged({}, VerticalSortHint);
}

void FavoritesDataSource::insert(PlaceRange range, const ItemList &from)
{
    beginInsertRows({}, range.first, range.first + range.count - 1);
    const auto first = from.begin() + range.first;
    m_items.insert(m_items.begin() + range.first, first, first + range.count);
    endInsertRows();
}

int FavoritesDataSource::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : static_cast<int>(m_items.size());
}

QVariant FavoritesDataSource::data(const QModelIndex &index, int role) const
{
    if (role != ItemRole || !checkIndex(index, CheckIndexOption::IndexIsValid | CheckIndexOption::ParentIsInvalid))
        return {};
    return QVariant::fromValue(m_items[static_cast<std::size_t>(index.row())]);
}

} // namespace favrin::favorites
