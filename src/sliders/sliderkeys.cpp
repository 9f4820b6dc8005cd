#include "sliders/sliderkeys.h"

#include "sliders/sliderrules.h"

#include <algorithm>
#include <cmath>

namespace favrin::sliders {
namespace {

/** 1 for an arrow to more, -1 for one to less, 0 for any other key. */
int arrowDirection(int key, Qt::LayoutDirection direction)
{
    const int toTheRight = direction == Qt::RightToLeft ? -1 : 1;
    switch (key) {
    case Qt::Key_Up:
        return 1;
    case Qt::Key_Down:
        return -1;
    case Qt::Key_Right:
        return toTheRight;
    case Qt::Key_Left:
        return -toTheRight;
    default:
        return 0;
    }
}

} // namespace

std::optional<double> valueForKey(int key, Qt::KeyboardModifiers modifiers, double value, int shownSteps,
                                  Qt::LayoutDirection direction)
{
    if (modifiers & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier))
        return std::nullopt;
    if (const int step = arrowDirection(key, direction))
        return std::clamp((std::round(value * shownSteps) + step) / shownSteps, 0.0, 1.0);
    switch (key) {
    case Qt::Key_PageUp:
        return incremented(value);
    case Qt::Key_PageDown:
        return decremented(value);
    case Qt::Key_Home:
        return 0.0;
    case Qt::Key_End:
        return 1.0;
    default:
        return std::nullopt;
    }
}

} // namespace favrin::sliders
