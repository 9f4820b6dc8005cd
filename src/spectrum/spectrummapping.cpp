#include "spectrum/spectrummapping.h"

#include "spectrum/hue.h"
#include "spectrum/spectrumrenderer.h"
#include "spectrum/timingcurve.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace favrin::spectrum {
namespace {

constexpr double nearZero = 0.001;
constexpr double nearOne = 0.999;

const TimingCurve &lightnessCurve()
{
    static const TimingCurve curve(0.42F, 0.1F, 0.83F, 0.95F);
    return curve;
}

} // namespace

float lightnessFactor(float x)
{
    // Negative zero lies in the right half.
    return x < 0.0F ? lightnessCurve().y(1.0F - std::abs(x)) : 1.0F - lightnessCurve().y(std::abs(x));
}

FieldColor shaded(const FieldColor &hue, float x, float factor)
{
    const float largest = std::max({hue.r, hue.g, hue.b});
    if (x < 0.0F) {
        const auto tint = [=](float component) { return largest + (component - largest) * factor; };
        return {tint(hue.r), tint(hue.g), tint(hue.b), hue.a};
    }
    const auto shade = [=](float component) { return component * (factor / largest); };
    return {shade(hue.r), shade(hue.g), shade(hue.b), hue.a};
}

FieldColor fieldColor(FieldLocation location)
{
    return shaded(hueColor(location.y), location.x, lightnessFactor(location.x));
}

FieldLocation fieldLocation(const FieldColor &color)
{
    const auto [r, g, b, a] = color;
    const float largest = std::max({r, g, b});
    if (largest < 1.0F) {
        const float y = huePosition(hueAngle(r / largest, g / largest, b / largest));
        return {lightnessCurve().x(1.0F - largest), y};
    }
    const float smallest = std::min({r, g, b});
    return {lightnessCurve().x(1.0F - smallest) - 1.0F, huePosition(hueAngle(r, g, b))};
}

QPointF locationForPoint(QPointF point, QSizeF size)
{
    const double x = 2.0 * (point.x() / size.width()) - 1.0;
    const double y = -(2.0 * (point.y() / size.height()) - 1.0);
    return {std::clamp(x, -1.0, 1.0), std::clamp(y, -1.0, 1.0)};
}

QPointF pointForLocation(QPointF location, QSizeF size)
{
    return {(location.x() + 1.0) * 0.5 * size.width(), size.height() - (location.y() + 1.0) * 0.5 * size.height()};
}

platform::Color colorForPoint(QPointF point, QSizeF size)
{
    return SpectrumRenderer::colorAtLocation(locationForPoint(point, size));
}

std::optional<QPointF> pointForColor(const model::SomeColor &color, QSizeF size)
{
    const model::SomeColor sRGB = color.inSRGB();
    const std::array components = {sRGB.r, sRGB.g, sRGB.b};
    const auto isLow = [](double component) { return component < nearZero; };
    const auto isHigh = [](double component) { return component > nearOne; };
    const auto isAtAnEnd = [=](double component) { return isLow(component) || isHigh(component); };
    if (std::ranges::none_of(components, isAtAnEnd))
        return std::nullopt;
    // Black and white lie on a whole edge.
    if (std::ranges::all_of(components, isLow) || std::ranges::all_of(components, isHigh))
        return std::nullopt;
    const QPointF location =
        SpectrumRenderer::positionForColor({static_cast<float>(sRGB.r), static_cast<float>(sRGB.g),
                                            static_cast<float>(sRGB.b), static_cast<float>(sRGB.a)});
    return pointForLocation(location, size);
}

} // namespace favrin::spectrum
