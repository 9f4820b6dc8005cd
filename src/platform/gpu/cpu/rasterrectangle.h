#pragma once

#include "platform/gpu/cpu/cpufunctions.h"

#include <QRect>

#include <optional>
#include <vector>

namespace favrin::platform::gpu::cpu {

/** The pixels that an upright rectangle of two triangles covers, with what is passed on to their columns and rows. */
struct RasterRectangle
{
    QRect pixels;
    std::vector<float> columns;
    std::vector<float> rows;
};

/**
 * The rectangle that @p vertices, two triangles, cover in a viewport of @p size pixels; a pixel is covered when its
 * middle is. None when the triangles do not make up an upright rectangle, or pass on what varies along both axes.
 */
std::optional<RasterRectangle> rasterRectangle(std::span<const ShadedVertex, 6> vertices, QSize size);

} // namespace favrin::platform::gpu::cpu
