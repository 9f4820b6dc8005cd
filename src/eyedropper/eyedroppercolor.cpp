#include "eyedropper/eyedroppercolor.h"

#include "remote/wirecolor.h"

#include <algorithm>
#include <cmath>
#include <vector>

namespace favrin::eyedropper {

std::optional<ColorArguments> encodeColor(const platform::Color &color)
{
    const auto wire = remote::encodeColor(color);
    if (!wire || !wire->space)
        return std::nullopt;
    return ColorArguments{QString::fromStdString(*wire->space),
                          QList<double>(wire->numbers.begin(), wire->numbers.end())};
}

std::optional<platform::Color> decodeColor(const ColorArguments &arguments)
{
    const auto space = platform::ColorSpace::named(arguments.colorspace.toStdString());
    if (!space || arguments.components.size() != static_cast<qsizetype>(space->componentCount()) + 1)
        return std::nullopt;
    if (!std::ranges::all_of(arguments.components, [](double number) { return std::isfinite(number); }))
        return std::nullopt;

    std::vector<double> components(arguments.components.begin(), arguments.components.end() - 1);
    if (space->range() == platform::ColorSpace::Range::Standard) {
        for (double &component : components)
            component = std::clamp(component, 0.0, 1.0);
    }
    return platform::Color(space, components, std::clamp(arguments.components.last(), 0.0, 1.0));
}

} // namespace favrin::eyedropper
