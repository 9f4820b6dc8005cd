#include "platform/color/color.h"
#include "platform/color/rgbconversion.h"

#include <algorithm>
#include <cmath>

namespace favrin::platform {

namespace {

using Model = ColorSpace::Model;

Triple componentsOf(const Color &color)
{
    const std::span<const double> given = color.components();
    if (given.size() == 1)
        return {given[0], given[0], given[0]};
    return {given[0], given[1], given[2]};
}

bool isFinite(const Triple &value)
{
    return std::all_of(value.begin(), value.end(), [](double component) { return std::isfinite(component); });
}

Triple clipped(const Triple &value)
{
    return {std::clamp(value[0], 0.0, 1.0), std::clamp(value[1], 0.0, 1.0), std::clamp(value[2], 0.0, 1.0)};
}

// On the same primaries and curve nothing but the range differs; a gray on that curve is neutral in both RGB spaces.
bool needsOnlyClipping(Model source, Model target)
{
    if (source == target)
        return true;
    const bool targetIsOnTheCurve = target == Model::SRGB || target == Model::DisplayP3;
    return (source == Model::Gray && targetIsOnTheCurve) || (source == Model::ExtendedSRGB && target == Model::SRGB);
}

Triple encodedInto(Model target, const Triple &linearSRGB)
{
    if (target == Model::LinearSRGB)
        return linearSRGB;
    const Triple linear = target == Model::DisplayP3 ? linearSRGBToLinearDisplayP3(linearSRGB) : linearSRGB;
    return {encodedSRGB(linear[0]), encodedSRGB(linear[1]), encodedSRGB(linear[2])};
}

} // namespace

ColorTransform::ColorTransform(ColorSpace::Model target) : m_target(target) {}

std::shared_ptr<const ColorTransform> ColorTransform::into(std::string_view targetName)
{
    static const std::shared_ptr<const ColorTransform> intoSRGB(new ColorTransform(Model::SRGB));
    static const std::shared_ptr<const ColorTransform> intoDisplayP3(new ColorTransform(Model::DisplayP3));
    static const std::shared_ptr<const ColorTransform> intoLinearSRGB(new ColorTransform(Model::LinearSRGB));
    if (targetName == colorspacename::sRGB)
        return intoSRGB;
    if (targetName == colorspacename::displayP3)
        return intoDisplayP3;
    if (targetName == colorspacename::linearSRGB)
        return intoLinearSRGB;
    return nullptr;
}

std::optional<Triple> ColorTransform::convert(const Color &color, RenderingIntent) const
{
    const std::optional<ColorSpace> &source = color.colorSpace();
    const Triple components = componentsOf(color);
    if (!source || !isFinite(components))
        return std::nullopt;
    if (needsOnlyClipping(source->model(), m_target))
        return clipped(components);
    const Triple converted = encodedInto(m_target, source->toLinearSRGB(components));
    if (!isFinite(converted))
        return std::nullopt;
    return clipped(converted);
}

} // namespace favrin::platform
