#include "spectrum/fieldblock.h"

#include "spectrum/displayp3columns.h"
#include "spectrum/fieldcolumns.h"
#include "spectrum/hue.h"

namespace favrin::spectrum {

using platform::gpu::cpu::FragmentBlock;

namespace {

inline std::uint32_t byte(float component)
{
    // By way of int, which the vector units convert to; a component lies in 0…1, so that adding a half rounds it.
    // NOLINTNEXTLINE(bugprone-incorrect-roundings)
    return static_cast<std::uint32_t>(static_cast<std::int32_t>(component * 255.0F + 0.5F));
}

} // namespace

void fillWithField(const FragmentBlock &block)
{
    const FieldColumns columns(block.columns);
    const float *bases = columns.bases.data();
    const float *factors = columns.factors.data();
    const std::size_t width = block.columns.size();
    std::uint32_t *row = block.pixels;
    for (const float y : block.rows) {
        const FieldColor hue = hueColor(y);
        for (std::size_t x = 0; x < width; ++x) {
            row[x] = 0xff000000U | (byte(lit(hue.r, bases[x], factors[x])) << 16U) |
                     (byte(lit(hue.g, bases[x], factors[x])) << 8U) | byte(lit(hue.b, bases[x], factors[x]));
        }
        row += block.rowStride;
    }
}

void fillWithFieldInDisplayP3(const FragmentBlock &block)
{
    DisplayP3Columns columns{FieldColumns(block.columns)};
    std::uint32_t *row = block.pixels;
    for (const float y : block.rows) {
        columns.writeRow(hueColor(y), row);
        row += block.rowStride;
    }
}

} // namespace favrin::spectrum
