#pragma once

#include <algorithm>
#include <array>
#include <cstdint>

namespace favrin::spectrum {

/**
 * Converts sRGB colors to pixels of Display P3 by tables: exact to a small part of one step of 1/255, at a tenth of the
 * cost of the curves themselves. Immutable once made; any thread.
 */
class DisplayP3Bytes
{
public:
    /** The tables of this process, made on first use. */
    static const DisplayP3Bytes &instance();

    /** Linear light of an encoded component that lies in 0…1. */
    float light(float component) const { return interpolated(m_decoded, component * static_cast<float>(decodedCount)); }

    /** 0xffRRGGBB in Display P3 of a color in linear sRGB whose components lie in 0…1. */
    std::uint32_t pixel(float red, float green, float blue) const
    {
        const auto byte = [=, this](const Row &row) { return encoded(row[0] * red + row[1] * green + row[2] * blue); };
        return 0xff000000U | (byte(m_rows[0]) << 16U) | (byte(m_rows[1]) << 8U) | byte(m_rows[2]);
    }

private:
    DisplayP3Bytes();

    static constexpr std::size_t decodedCount = 4096;
    static constexpr std::size_t encodedCount = 32768;
    using Row = std::array<float, 3>;
    // One entry more than the last that is meant, so that interpolation may always look at the next.
    template<std::size_t Count>
    using Table = std::array<float, Count + 2>;

    template<std::size_t Size>
    static float interpolated(const std::array<float, Size> &table, float position)
    {
        const auto index = static_cast<std::int32_t>(position);
        const float *entry = table.data() + index;
        return entry[0] + (entry[1] - entry[0]) * (position - static_cast<float>(index));
    }

    std::uint32_t encoded(float position) const
    {
        const float clipped = std::min(std::max(position, 0.0F), static_cast<float>(encodedCount));
        return static_cast<std::uint32_t>(static_cast<std::int32_t>(interpolated(m_encoded, clipped)));
    }

    /** From linear sRGB to the position of linear Display P3 in the table of encoded components. */
    std::array<Row, 3> m_rows = {};

    /** Linear light at equal steps of the encoded component. */
    Table<decodedCount> m_decoded;
    /** 255 times the encoded component, plus one half, at equal steps of linear light. */
    Table<encodedCount> m_encoded;
};

} // namespace favrin::spectrum
