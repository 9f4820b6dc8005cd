#pragma once

#include <array>
#include <bit>
#include <cmath>
#include <cstddef>
#include <cstdint>

namespace favrin::spectrum {

/**
 * Brings light in single precision to bytes of Display P3: to the very byte, but for light that is within a few units
 * of its last place of where two bytes meet. Immutable once made; any thread.
 *
 * The byte of some light is looked up by its place, which is the light plus lightZero: there the upper bits of a
 * floating-point number are steps fine enough that none holds more than one change of the byte.
 */
class DisplayP3Bytes
{
public:
    /** The place of no light. */
    static constexpr float lightZero = 0x1p-6F;

    /** The table of this process, made on first use. */
    static const DisplayP3Bytes &instance();

    /** How much linear Display P3 (by row) a linear sRGB component (by column) gives. */
    static const std::array<std::array<float, 3>, 3> &fromLinearSRGB();

    /** Linear light of an encoded component that lies in 0…1, to within 6e-7. Free of branches. */
    static float light(float component)
    {
        // A polynomial in the root of what the curve raises to the power of 2.4, and the straight part below it.
        const float curved = component > curveBegin ? component : curveBegin;
        const float straight = component < curveBegin ? component : curveBegin;
        const float root = std::sqrt(curved * (1.0F / 1.055F) + 0.055F / 1.055F);
        float sum = 0.0097291900F;
        sum = sum * root - 0.0795214315F;
        sum = sum * root + 0.8917454266F;
        sum = sum * root + 0.2261376091F;
        sum = sum * root - 0.0596870220F;
        sum = sum * root + 0.0133274574F;
        sum = sum * root - 0.0018458392F;
        sum = sum * root + (0.0001146172F - curveBegin / 12.92F);
        return sum + straight * (1.0F / 12.92F);
    }

    /** The byte at a place, in the bits 16…23; the bits below mean nothing. Light must lie in 0…1 (or hardly above). */
    std::uint32_t byteInBits16(float place) const
    {
        const auto bits = std::bit_cast<std::uint32_t>(place);
        return bits + m_offsets[static_cast<std::size_t>(bits >> 16U) - firstStep];
    }

private:
    DisplayP3Bytes();

    static constexpr float curveBegin = 0.04045F;
    static constexpr std::size_t firstStep = std::bit_cast<std::uint32_t>(lightZero) >> 16U;
    static constexpr std::size_t lastStep = std::bit_cast<std::uint32_t>(1.0F + 2.0F * lightZero) >> 16U;

    /** By step: what, added to the bits of a place, carries its byte into the bits 16…23. */
    std::array<std::uint32_t, lastStep - firstStep + 1> m_offsets = {};
};

} // namespace favrin::spectrum
