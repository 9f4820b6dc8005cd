#include "spectrum/fieldblock.h"

#include "spectrum/displayp3bytes.h"
#include "spectrum/hue.h"
#include "spectrum/spectrummapping.h"

#include <vector>

namespace favrin::spectrum {

using platform::gpu::cpu::FragmentBlock;

namespace {

/**
 * The lightness of each column, brought to one form for both halves: component' = base + (component - base)·factor,
 * where base is 1 for a tint and 0 for a shade. Hues have a largest component of 1, so that this is what shaded() does.
 */
struct Columns
{
    explicit Columns(std::span<const float> locations)
    {
        bases.reserve(locations.size());
        factors.reserve(locations.size());
        for (const float x : locations) {
            bases.push_back(x < 0.0F ? 1.0F : 0.0F);
            factors.push_back(lightnessFactor(x));
        }
    }

    std::vector<float> bases;
    std::vector<float> factors;
};

inline float lit(float component, float base, float factor)
{
    return base + (component - base) * factor;
}

inline std::uint32_t byte(float component)
{
    // By way of int, which the vector units convert to; a component lies in 0…1, so that adding a half rounds it.
    // NOLINTNEXTLINE(bugprone-incorrect-roundings)
    return static_cast<std::uint32_t>(static_cast<std::int32_t>(component * 255.0F + 0.5F));
}

template<class Pixel>
void fillRows(const FragmentBlock &block, Pixel pixel)
{
    const Columns columns(block.columns);
    const float *bases = columns.bases.data();
    const float *factors = columns.factors.data();
    const std::size_t width = block.columns.size();
    std::uint32_t *row = block.pixels;
    for (const float y : block.rows) {
        const FieldColor hue = hueColor(y);
        for (std::size_t x = 0; x < width; ++x) {
            row[x] = pixel(lit(hue.r, bases[x], factors[x]), lit(hue.g, bases[x], factors[x]),
                           lit(hue.b, bases[x], factors[x]));
        }
        row += block.rowStride;
    }
}

} // namespace

void fillWithField(const FragmentBlock &block)
{
    fillRows(block,
             [](float r, float g, float b) { return 0xff000000U | (byte(r) << 16U) | (byte(g) << 8U) | byte(b); });
}

void fillWithFieldInDisplayP3(const FragmentBlock &block)
{
    const DisplayP3Bytes &bytes = DisplayP3Bytes::instance();
    fillRows(block, [&bytes](float r, float g, float b) { return bytes.pixel(r, g, b); });
}

} // namespace favrin::spectrum
