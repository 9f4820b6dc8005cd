#include "spectrum/displayp3bytes.h"

#include "platform/color/rgbconversion.h"

#include <limits>

namespace favrin::spectrum {

namespace {

constexpr std::uint32_t stepBits = 1U << 16U;

/** The bits of the first place whose byte is @p byte or above. */
std::uint32_t firstPlaceOf(std::uint32_t byte)
{
    if (byte > 255)
        return std::numeric_limits<std::uint32_t>::max();
    const double place = DisplayP3Bytes::lightZero + platform::decodedSRGB((byte - 0.5) / 255.0);
    const auto bits = std::bit_cast<std::uint32_t>(static_cast<float>(place));
    return std::bit_cast<float>(bits) < place ? bits + 1 : bits;
}

} // namespace

DisplayP3Bytes::DisplayP3Bytes()
{
    std::uint32_t byte = 0;
    std::uint32_t change = firstPlaceOf(1);
    for (std::size_t i = 0; i < m_offsets.size(); ++i) {
        const std::uint32_t end = static_cast<std::uint32_t>(firstStep + i + 1) * stepBits;
        // From the change on, or from the end of the step, the sum has carried into the next byte.
        m_offsets[i] = (byte + 1) * stepBits - std::min(change, end);
        if (change < end)
            change = firstPlaceOf(++byte + 1);
    }
}

const DisplayP3Bytes &DisplayP3Bytes::instance()
{
    static const DisplayP3Bytes table;
    return table;
}

const std::array<std::array<float, 3>, 3> &DisplayP3Bytes::fromLinearSRGB()
{
    static const auto rows = [] {
        std::array<std::array<float, 3>, 3> matrix = {};
        for (std::size_t column = 0; column < matrix.size(); ++column) {
            platform::Triple unit = {};
            unit[column] = 1.0;
            const platform::Triple converted = platform::linearSRGBToLinearDisplayP3(unit);
            for (std::size_t row = 0; row < matrix.size(); ++row)
                matrix[row][column] = static_cast<float>(converted[row]);
        }
        return matrix;
    }();
    return rows;
}

} // namespace favrin::spectrum
