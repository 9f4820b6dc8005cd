#include "favorites/coloritem.h"

#include <QHashFunctions>

namespace favrin::favorites {

using model::SomeColor;

ColorItem ColorItem::suggestedColor(const SomeColor &color, int index)
{
    return {Kind::suggestedColor, color, index};
}

ColorItem ColorItem::filler(int index)
{
    return {Kind::filler, std::nullopt, index};
}

ColorItem ColorItem::favoriteColor(const SomeColor &color, int occurrence)
{
    return {Kind::color, color, occurrence};
}

ColorItem ColorItem::addButton()
{
    return {Kind::addButton, std::nullopt, 0};
}

ColorItem ColorItem::removeButton()
{
    return {Kind::removeButton, std::nullopt, 0};
}

} // namespace favrin::favorites

std::size_t std::hash<favrin::favorites::ColorItem>::operator()(const favrin::favorites::ColorItem &item) const noexcept
{
    const std::size_t color = item.color ? std::hash<favrin::model::SomeColor>()(*item.color) : 0;
    return qHashMulti(color, static_cast<int>(item.kind), item.number);
}
