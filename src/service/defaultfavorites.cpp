#include "service/defaultfavorites.h"

#include <array>

namespace favrin::service {

using model::SomeColor;

namespace {

/** 0 to 255 each. */
using Bytes = std::array<int, 3>;
using Table = std::array<Bytes, 5>;

constexpr Table sRGBTable = {{{0, 0, 0}, {0, 97, 253}, {51, 199, 89}, {255, 204, 1}, {255, 58, 47}}};
/** The same colors in Display P3, rounded to whole bytes. */
constexpr Table displayP3Table = {{{0, 0, 0}, {40, 95, 244}, {100, 196, 102}, {247, 206, 70}, {235, 77, 61}}};

} // namespace

std::vector<SomeColor> defaultFavorites(SomeColor::ColorSpace space)
{
    std::vector<SomeColor> colors;
    for (const auto &[r, g, b] : space == SomeColor::ColorSpace::displayP3 ? displayP3Table : sRGBTable)
        colors.emplace_back(r / 255.0, g / 255.0, b / 255.0, 1.0, space);
    return colors;
}

} // namespace favrin::service
