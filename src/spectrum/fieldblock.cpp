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

/**
 * Linear light of one component along a row. The hues hold the components 0 and 1 everywhere and a third that differs
 * from row to row: the light of those two is found once for all rows.
 */
class LightOfColumns
{
public:
    LightOfColumns(const Columns &columns, const DisplayP3Bytes &bytes)
        : m_columns(columns), m_bytes(bytes), m_ofZero(light(0.0F)), m_ofOne(light(1.0F))
    {
    }

    /** Valid until the next call. */
    const float *of(float component)
    {
        if (component == 0.0F || component == 1.0F)
            return component == 0.0F ? m_ofZero.data() : m_ofOne.data();
        m_ofThis = light(component);
        return m_ofThis.data();
    }

private:
    std::vector<float> light(float component) const
    {
        std::vector<float> values(m_columns.bases.size());
        for (std::size_t x = 0; x < values.size(); ++x)
            values[x] = m_bytes.light(lit(component, m_columns.bases[x], m_columns.factors[x]));
        return values;
    }

    const Columns &m_columns;
    const DisplayP3Bytes &m_bytes;
    std::vector<float> m_ofZero;
    std::vector<float> m_ofOne;
    std::vector<float> m_ofThis;
};

} // namespace

void fillWithField(const FragmentBlock &block)
{
    const Columns columns(block.columns);
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
    const DisplayP3Bytes &bytes = DisplayP3Bytes::instance();
    const Columns columns(block.columns);
    LightOfColumns light(columns, bytes);
    const std::size_t width = block.columns.size();
    std::uint32_t *row = block.pixels;
    for (const float y : block.rows) {
        const FieldColor hue = hueColor(y);
        const float *red = light.of(hue.r);
        const float *green = light.of(hue.g);
        const float *blue = light.of(hue.b);
        for (std::size_t x = 0; x < width; ++x)
            row[x] = bytes.pixel(red[x], green[x], blue[x]);
        row += block.rowStride;
    }
}

} // namespace favrin::spectrum
