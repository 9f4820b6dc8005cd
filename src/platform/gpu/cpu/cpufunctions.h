#pragma once

#include <QtGlobal>

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>

namespace favrin::platform::gpu::cpu {

/** What a vertex function makes of a vertex: its place in clip space (y up), and what goes on to the fragments. */
struct ShadedVertex
{
    float clipX = 0.0F;
    float clipY = 0.0F;
    float x = 0.0F;
    float y = 0.0F;
};

/**
 * A block of fragments in rows and columns. What the vertices passed on depends on the column alone for x and on the
 * row alone for y, so that a function can compute what a whole column or row has in common once.
 */
struct FragmentBlock
{
    /** x of each column and y of each row, at the middle of the pixels. */
    std::span<const float> columns;
    std::span<const float> rows;
    /** The top left pixel, as 0xAARRGGBB. */
    std::uint32_t *pixels = nullptr;
    /** In pixels. */
    std::ptrdiff_t rowStride = 0;
};

/** A vertex function for the processor; @p attribute points to the floats of the vertex. */
struct CpuVertexFunction
{
    std::string name;
    ShadedVertex (*shade)(const float *attribute) = nullptr;
};

/** A fragment function for the processor: writes every pixel of a block. */
struct CpuFragmentFunction
{
    std::string name;
    void (*shade)(const FragmentBlock &block, std::span<const std::uint32_t> constants) = nullptr;
};

} // namespace favrin::platform::gpu::cpu
