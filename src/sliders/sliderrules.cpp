#include "sliders/sliderrules.h"

#include <algorithm>

namespace favrin::sliders {

using model::SomeColor;
using Component = SomeColor::Component;

namespace {

constexpr double largeStep = 0.1;

} // namespace

double valueAt(double x, QSizeF size, Qt::LayoutDirection direction)
{
    const double width = size.width();
    const double inset = size.height() / 2.0;
    const double fromLeading = direction == Qt::RightToLeft ? width - x : x;
    const double onTrack = std::max(std::min(fromLeading, width - inset), inset);
    const double value = (onTrack - inset) / (width - size.height());
    // Written so that what is not a number becomes 0.
    return value > 0.0 ? std::min(value, 1.0) : 0.0;
}

QPointF thumbCenter(double value, QSizeF size, Qt::LayoutDirection direction)
{
    const double fromLeft = direction == Qt::RightToLeft ? 1.0 - value : value;
    const double inset = size.height() / 2.0;
    return {inset + fromLeft * (size.width() - size.height()), inset};
}

std::pair<SomeColor, SomeColor> gradientStops(const std::optional<SomeColor> &selectedColor, Component component)
{
    constexpr auto sRGB = SomeColor::ColorSpace::sRGB;
    const SomeColor base = selectedColor.value_or(SomeColor(0.0, 0.0, 0.0, 1.0, sRGB)).setting(Component::a, 1.0);
    return {base.setting(component, 0.0), base.setting(component, 1.0)};
}

double incremented(double value)
{
    return std::min(value + largeStep, 1.0);
}

double decremented(double value)
{
    return std::max(value - largeStep, 0.0);
}

int shownSteps(Component component)
{
    return component == Component::a ? 100 : 255;
}

} // namespace favrin::sliders
