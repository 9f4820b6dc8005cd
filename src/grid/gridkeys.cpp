#include "grid/gridkeys.h"

#include <algorithm>

namespace favrin::grid {
namespace {

std::optional<CellPosition> arrowStep(int key)
{
    switch (key) {
    case Qt::Key_Left:
        return CellPosition{0, -1};
    case Qt::Key_Right:
        return CellPosition{0, 1};
    case Qt::Key_Up:
        return CellPosition{-1, 0};
    case Qt::Key_Down:
        return CellPosition{1, 0};
    default:
        return std::nullopt;
    }
}

std::optional<CellPosition> jump(int key, bool control, CellPosition from)
{
    const auto [rows, columns] = gridDimensions();
    switch (key) {
    case Qt::Key_Home:
        return CellPosition{control ? 0 : from.row, 0};
    case Qt::Key_End:
        return CellPosition{control ? rows - 1 : from.row, columns - 1};
    case Qt::Key_PageUp:
        return CellPosition{0, from.column};
    case Qt::Key_PageDown:
        return CellPosition{rows - 1, from.column};
    default:
        return std::nullopt;
    }
}

} // namespace

std::optional<CellPosition> cellForKey(int key, Qt::KeyboardModifiers modifiers, std::optional<CellPosition> marked,
                                       CellPosition start)
{
    const bool control = modifiers.testFlag(Qt::ControlModifier);
    if (modifiers & (Qt::AltModifier | Qt::MetaModifier))
        return std::nullopt;

    const auto step = arrowStep(key);
    if (!step)
        return control && key != Qt::Key_Home && key != Qt::Key_End ? std::nullopt
                                                                    : jump(key, control, marked.value_or(start));
    if (control)
        return std::nullopt;
    if (!marked)
        return start;
    const auto [rows, columns] = gridDimensions();
    return CellPosition{std::clamp(marked->row + step->row, 0, rows - 1),
                        std::clamp(marked->column + step->column, 0, columns - 1)};
}

} // namespace favrin::grid
