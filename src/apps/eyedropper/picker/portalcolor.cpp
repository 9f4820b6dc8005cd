#include "apps/eyedropper/picker/portalcolor.h"

#include <QDBusArgument>

#include <algorithm>
#include <array>
#include <cmath>

namespace favrin::eyedropper {

double roundedComponent(double value)
{
    constexpr double steps = 65535.0;
    return std::round(std::clamp(value, 0.0, 1.0) * steps) / steps;
}

std::optional<platform::Color> colorOfPortal(const QVariantMap &results)
{
    const QVariant value = results.value(QStringLiteral("color"));
    if (!value.canConvert<QDBusArgument>())
        return std::nullopt;
    const auto argument = value.value<QDBusArgument>();
    if (argument.currentSignature() != u"(ddd)")
        return std::nullopt;
    std::array<double, 3> components = {};
    argument.beginStructure();
    for (double &component : components)
        argument >> component;
    argument.endStructure();
    if (!std::ranges::all_of(components, [](double component) { return std::isfinite(component); }))
        return std::nullopt;
    std::ranges::transform(components, components.begin(), roundedComponent);
    return platform::Color(platform::ColorSpace::sRGB(), components, 1.0);
}

} // namespace favrin::eyedropper
