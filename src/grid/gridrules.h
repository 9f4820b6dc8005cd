#pragma once

#include "grid/rectcorner.h"
#include "grid/swatchpalettes.h"

#include <QPointF>
#include <QRectF>
#include <QSizeF>

#include <optional>

/** Where cells lie, which one is meant and which one is marked: plain functions. Lengths in points unless said. */
namespace favrin::grid {

/** A cell by row (0 at the top) and column (0 at the left). */
struct CellPosition
{
    int row = 0;
    int column = 0;

    bool operator==(const CellPosition &) const = default;
};

struct GridDimensions
{
    int rows = 0;
    int columns = 0;
};

/** Rows and columns of the grid; both palettes have the same. */
GridDimensions gridDimensions();

/**
 * The cell under a location in a grid of @p size; beyond an edge the nearest cell. None where no cell can be named: an
 * empty grid, or a location that is not finite.
 */
std::optional<CellPosition> cellAt(QPointF location, QSizeF size);

/** The first cell, in reading order, that shows the selected color, its opacity aside. */
std::optional<CellPosition> markedCell(const std::optional<model::SomeColor> &selectedColor,
                                       const ColorMatrix &palette);

/** Whether a cell counts as selected for assistive technologies: here opacity matters. */
bool isSelected(const std::optional<model::SomeColor> &selectedColor, const model::SomeColor &cellColor);

/** The outer corner of the grid that the cell forms, if any. */
RectCorners maskedCorner(CellPosition cell);

/** The cell whose color lies nearest to @p color, the first of equals. */
CellPosition nearestCell(const model::SomeColor &color, const ColorMatrix &palette);

/** What @p selectedColor becomes by picking @p swatch: opacity and color space stay. */
model::SomeColor picked(const model::SomeColor &swatch, const model::SomeColor &selectedColor);

/**
 * The cell's area in whole pixels of a grid that is @p size pixels large. Neighbours share their edges, so that no seam
 * shows; each edge is the true one, rounded.
 */
QRect cellPixels(CellPosition cell, QSize size);

} // namespace favrin::grid
