#include "grid/gridrules.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace favrin::grid {
namespace {

using model::SomeColor;

/** The floor comes before the clamp, and both before the number becomes an integer: it may be as large as any. */
std::optional<int> indexAt(double location, double extent, int count)
{
    const double index = std::floor(location / (extent / count));
    if (!std::isfinite(index))
        return std::nullopt;
    return static_cast<int>(std::clamp(index, 0.0, count - 1.0));
}

double squaredDistance(const SomeColor &one, const SomeColor &other)
{
    const double r = one.r - other.r;
    const double g = one.g - other.g;
    const double b = one.b - other.b;
    return r * r + g * g + b * b;
}

/** The first pixel whose middle lies in the cell: what is drawn and what is hit agree at every pixel. */
int edgePixel(int index, int count, int extent)
{
    return static_cast<int>(std::ceil(static_cast<double>(extent) * index / count - 0.5));
}

/** The first cell, in reading order, for which @p matches is true. */
template<class Predicate>
std::optional<CellPosition> firstCell(const ColorMatrix &palette, Predicate matches)
{
    for (int row = 0; row < static_cast<int>(palette.size()); ++row) {
        const auto &colors = palette[static_cast<std::size_t>(row)];
        const auto found = std::find_if(colors.begin(), colors.end(), matches);
        if (found != colors.end())
            return CellPosition{row, static_cast<int>(found - colors.begin())};
    }
    return std::nullopt;
}

} // namespace

GridDimensions gridDimensions()
{
    const ColorMatrix &matrix = defaultColorMatrix();
    return {static_cast<int>(matrix.size()), static_cast<int>(matrix.front().size())};
}

std::optional<CellPosition> cellAt(QPointF location, QSizeF size)
{
    const auto [rows, columns] = gridDimensions();
    const auto row = indexAt(location.y(), size.height(), rows);
    const auto column = indexAt(location.x(), size.width(), columns);
    if (size.isEmpty() || !row || !column)
        return std::nullopt;
    return CellPosition{*row, *column};
}

std::optional<CellPosition> markedCell(const std::optional<SomeColor> &selectedColor, const ColorMatrix &palette)
{
    if (!selectedColor)
        return std::nullopt;
    const SomeColor color = selectedColor->inSRGB();
    return firstCell(palette, [&color](const SomeColor &cell) { return cell.isApproximatelyEqual(color, false); });
}

bool isSelected(const std::optional<SomeColor> &selectedColor, const SomeColor &cellColor)
{
    return selectedColor && selectedColor->inSRGB().isApproximatelyEqual(cellColor, true);
}

RectCorners maskedCorner(CellPosition cell)
{
    const auto [rows, columns] = gridDimensions();
    const bool top = cell.row == 0;
    const bool bottom = cell.row == rows - 1;
    const bool left = cell.column == 0;
    const bool right = cell.column == columns - 1;
    if (top && left)
        return RectCorner::topLeft;
    if (bottom && left)
        return RectCorner::bottomLeft;
    if (top && right)
        return RectCorner::topRight;
    if (bottom && right)
        return RectCorner::bottomRight;
    return {};
}

CellPosition nearestCell(const SomeColor &color, const ColorMatrix &palette)
{
    const SomeColor target = color.inSRGB();
    double smallest = std::numeric_limits<double>::infinity();
    for (const auto &row : palette) {
        for (const SomeColor &cell : row)
            smallest = std::min(smallest, squaredDistance(cell, target));
    }
    const auto isNearest = [&](const SomeColor &cell) { return squaredDistance(cell, target) == smallest; };
    return firstCell(palette, isNearest).value_or(CellPosition());
}

SomeColor picked(const SomeColor &swatch, const SomeColor &selectedColor)
{
    return swatch.converted(selectedColor.colorSpace).setting(SomeColor::Component::a, selectedColor.a);
}

QRect cellPixels(CellPosition cell, QSize size)
{
    const auto [rows, columns] = gridDimensions();
    const QPoint topLeft(edgePixel(cell.column, columns, size.width()), edgePixel(cell.row, rows, size.height()));
    const QPoint end(edgePixel(cell.column + 1, columns, size.width()), edgePixel(cell.row + 1, rows, size.height()));
    return {topLeft, QSize(end.x() - topLeft.x(), end.y() - topLeft.y())};
}

} // namespace favrin::grid
