#include "platform/gpu/cpu/rasterrectangle.h"

#include <algorithm>
#include <cmath>

namespace favrin::platform::gpu::cpu {
namespace {

/** The bits of a corner say whether it lies at the right and whether it lies at the top. */
std::optional<unsigned> cornerOf(const ShadedVertex &vertex, const ShadedVertex &bottomLeft,
                                 const ShadedVertex &topRight)
{
    const bool right = vertex.clipX == topRight.clipX;
    const bool top = vertex.clipY == topRight.clipY;
    const ShadedVertex expected = {right ? topRight.clipX : bottomLeft.clipX, top ? topRight.clipY : bottomLeft.clipY,
                                   right ? topRight.x : bottomLeft.x, top ? topRight.y : bottomLeft.y};
    const bool matches = vertex.clipX == expected.clipX && vertex.clipY == expected.clipY && vertex.x == expected.x &&
                         vertex.y == expected.y;
    return matches ? std::optional((right ? 1U : 0U) | (top ? 2U : 0U)) : std::nullopt;
}

/** The one corner that the triangle from @p first on leaves out; none if it is no half of the rectangle. */
std::optional<unsigned> missingCorner(std::span<const ShadedVertex> triangle, const ShadedVertex &bottomLeft,
                                      const ShadedVertex &topRight)
{
    unsigned missing = 0b1111U;
    for (const ShadedVertex &vertex : triangle) {
        const auto corner = cornerOf(vertex, bottomLeft, topRight);
        if (!corner)
            return std::nullopt;
        missing &= ~(1U << *corner);
    }
    for (unsigned corner = 0; corner < 4; ++corner) {
        if (missing == 1U << corner)
            return corner;
    }
    return std::nullopt;
}

/** The pixels first…last-1 along one axis whose middles lie in begin…end. */
std::pair<int, int> covered(double begin, double end, int count)
{
    const auto index = [count](double edge) {
        return static_cast<int>(std::clamp(std::ceil(edge - 0.5), 0.0, static_cast<double>(count)));
    };
    return {index(begin), index(end)};
}

std::vector<float> interpolated(double begin, double end, float from, float to, std::pair<int, int> pixels)
{
    std::vector<float> values;
    values.reserve(static_cast<std::size_t>(pixels.second - pixels.first));
    for (int pixel = pixels.first; pixel < pixels.second; ++pixel) {
        const double share = (pixel + 0.5 - begin) / (end - begin);
        values.push_back(static_cast<float>(from + (static_cast<double>(to) - from) * share));
    }
    return values;
}

} // namespace

std::optional<RasterRectangle> rasterRectangle(std::span<const ShadedVertex, 6> vertices, QSize size)
{
    const auto sum = [](const ShadedVertex &vertex) { return vertex.clipX + vertex.clipY; };
    const auto [bottomLeft, topRight] = std::ranges::minmax(vertices, {}, sum);
    const auto first = missingCorner(vertices.first(3), bottomLeft, topRight);
    const auto second = missingCorner(vertices.last(3), bottomLeft, topRight);
    // Two halves make a whole when they leave out opposite corners.
    if (!first || !second || (*first ^ *second) != 0b11U)
        return std::nullopt;

    const auto pixelX = [size](float clip) { return (static_cast<double>(clip) + 1.0) / 2.0 * size.width(); };
    const auto pixelY = [size](float clip) { return (1.0 - static_cast<double>(clip)) / 2.0 * size.height(); };
    const double left = pixelX(bottomLeft.clipX);
    const double right = pixelX(topRight.clipX);
    const double top = pixelY(topRight.clipY);
    const double bottom = pixelY(bottomLeft.clipY);
    const auto columns = covered(left, right, size.width());
    const auto rows = covered(top, bottom, size.height());
    return RasterRectangle{
        .pixels = QRect(QPoint(columns.first, rows.first), QPoint(columns.second - 1, rows.second - 1)),
        .columns = interpolated(left, right, bottomLeft.x, topRight.x, columns),
        .rows = interpolated(top, bottom, topRight.y, bottomLeft.y, rows),
    };
}

} // namespace favrin::platform::gpu::cpu
