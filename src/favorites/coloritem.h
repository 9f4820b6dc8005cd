#pragma once

#include "model/somecolor.h"

#include <QMetaType>

#include <functional>
#include <optional>

namespace favrin::favorites {

/** The identity of one item of the strip. Two items are the same when their kind and all that they carry are equal. */
struct ColorItem
{
    enum class Kind { suggestedColor, filler, color, addButton, removeButton };

    Kind kind = Kind::filler;
    /** The color of a suggested or favorite color, none for the other kinds. */
    std::optional<model::SomeColor> color;
    /** A suggested color's place among the suggested, a filler's among the fillers, a favorite's occurrence number. */
    int number = 0;

    static ColorItem suggestedColor(const model::SomeColor &color, int index);
    static ColorItem filler(int index);
    static ColorItem favoriteColor(const model::SomeColor &color, int occurrence);
    static ColorItem addButton();
    static ColorItem removeButton();

    bool operator==(const ColorItem &) const = default;
};

} // namespace favrin::favorites

template<>
struct std::hash<favrin::favorites::ColorItem>
{
    std::size_t operator()(const favrin::favorites::ColorItem &item) const noexcept;
};

Q_DECLARE_METATYPE(favrin::favorites::ColorItem)
