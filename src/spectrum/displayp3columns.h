#pragma once

#include "spectrum/displayp3bytes.h"
#include "spectrum/fieldcolor.h"
#include "spectrum/fieldcolumns.h"

#include <cstddef>
#include <optional>

namespace favrin::spectrum {

/**
 * The columns of the field as Display P3 shows them, from which its rows are written. Along the hues two of the three
 * components, a full one and one of zero, stay for a sixth of the way; their light is found once for all those rows.
 */
class DisplayP3Columns
{
public:
    explicit DisplayP3Columns(const FieldColumns &columns);

    /** Writes a pixel for each column. Fastest when neighboring rows come one after the other. */
    void writeRow(const FieldColor &hue, std::uint32_t *pixels);

    /** The components of a hue by index (red, green, blue): a full one, one of zero, and what the third is. */
    struct HueParts
    {
        explicit HueParts(const FieldColor &hue);
        bool hasFixedPartsOf(const HueParts &other) const { return full == other.full && zero == other.zero; }

        std::size_t full;
        std::size_t zero;
        std::size_t moving;
        float component;
    };

    static constexpr std::size_t runLength = 64;
    using Values = std::array<float, runLength>;
    using Pixels = std::array<std::uint32_t, runLength>;

    /** Neighboring columns: their lightness, and what the two components that stay give. */
    struct Run
    {
        Values bases = {};
        Values factors = {};
        /** The places of their red, green and blue light. */
        std::array<Values, 3> places = {};
        /** Opaque pixels of their red and green. */
        Pixels redAndGreen = {};
    };

private:
    void setFixedParts(Run &run, const HueParts &hue) const;

    const DisplayP3Bytes &m_bytes = DisplayP3Bytes::instance();
    std::size_t m_count;
    std::vector<Run> m_runs;
    std::optional<HueParts> m_fixed;
};

} // namespace favrin::spectrum
