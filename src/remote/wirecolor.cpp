#include "remote/wirecolor.h"

#include "remote/limits.h"

#include <algorithm>
#include <cmath>
#include <cstring>

namespace favrin::remote {

namespace {

/** @p color itself, or the same color in a space that has a name. */
Color inNamedSpace(const Color &color)
{
    if (!color.colorSpace() || color.colorSpace()->name())
        return color;
    platform::Triple encoded = {};
    std::ranges::copy(color.components(), encoded.begin());
    const platform::Triple linear = color.colorSpace()->toLinearSRGB(encoded);
    return Color(platform::ColorSpace::linearSRGB(), linear, color.alpha());
}

std::optional<platform::ColorSpace> knownSpace(std::optional<std::string_view> name)
{
    return name ? platform::ColorSpace::named(*name) : std::nullopt;
}

std::size_t numbersPerColor(const std::optional<platform::ColorSpace> &space)
{
    return (space ? space->componentCount() : 3) + 1;
}

Color colorOf(const std::optional<platform::ColorSpace> &space, std::span<const double> numbers)
{
    return Color(space, numbers.first(numbers.size() - 1), numbers.back());
}

void append(std::vector<double> &numbers, const Color &color)
{
    numbers.insert(numbers.end(), color.components().begin(), color.components().end());
    numbers.push_back(color.alpha());
}

std::string nameOf(const Color &color)
{
    return color.colorSpace() ? color.colorSpace()->name().value_or(std::string()) : std::string();
}

} // namespace

bool isFinite(const Color &color)
{
    return std::ranges::all_of(color.components(), [](double value) { return std::isfinite(value); }) &&
           std::isfinite(color.alpha());
}

std::optional<WireColor> encodeColor(const std::optional<Color> &color)
{
    if (!color)
        return WireColor{};
    const Color sent = inNamedSpace(*color);
    if (!isFinite(sent))
        return std::nullopt;
    WireColor wire;
    append(wire.numbers, sent);
    if (sent.colorSpace())
        wire.space = sent.colorSpace()->name();
    return wire;
}

std::optional<std::optional<Color>> decodeColor(std::span<const std::byte> array, std::optional<std::string_view> space)
{
    if (array.empty())
        return std::optional<Color>();
    const std::optional<platform::ColorSpace> known = knownSpace(space);
    const auto numbers = decodeNumbers(array, numbersPerColor(known));
    if (!numbers)
        return std::nullopt;
    return colorOf(known, *numbers);
}

std::vector<WireColorRun> encodeColorRuns(std::span<const Color> colors)
{
    std::vector<WireColorRun> runs;
    std::size_t inRun = 0;
    for (const Color &color : colors.first(std::min(colors.size(), limits::suggestedColors))) {
        const Color sent = inNamedSpace(color);
        if (!isFinite(sent))
            continue;
        std::string space = nameOf(sent);
        if (runs.empty() || runs.back().space != space || inRun == limits::colorsPerEvent) {
            runs.push_back({std::move(space), {}});
            inRun = 0;
        }
        append(runs.back().numbers, sent);
        ++inRun;
    }
    return runs;
}

std::optional<std::vector<Color>> decodeColorRun(std::span<const std::byte> array, std::string_view space)
{
    const std::optional<platform::ColorSpace> known = knownSpace(space);
    const std::size_t perColor = numbersPerColor(known);
    const std::size_t count = array.size() / (perColor * sizeof(double));
    if (count > limits::colorsPerEvent)
        return std::nullopt;
    const auto numbers = decodeNumbers(array, count * perColor);
    if (!numbers)
        return std::nullopt;
    std::vector<Color> colors;
    for (std::size_t i = 0; i < count; ++i)
        colors.push_back(colorOf(known, std::span(*numbers).subspan(i * perColor, perColor)));
    return colors;
}

std::optional<std::vector<double>> decodeNumbers(std::span<const std::byte> array, std::size_t count)
{
    if (array.size() != count * sizeof(double))
        return std::nullopt;
    std::vector<double> numbers(count);
    if (count > 0)
        std::memcpy(numbers.data(), array.data(), array.size());
    if (!std::ranges::all_of(numbers, [](double value) { return std::isfinite(value); }))
        return std::nullopt;
    return numbers;
}

} // namespace favrin::remote
