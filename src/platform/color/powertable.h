#pragma once

#include <array>
#include <bit>
#include <cmath>
#include <cstddef>
#include <cstdint>

namespace favrin::platform {

/**
 * x to the power of Numerator/Denominator for x in 2^LowestExponent…1, to within two units of the last place and at a
 * third of the cost of std::pow: the power of a place nearby, and the series of what x is more than that. Made at
 * compile time. At the places themselves, 1 among them, the result is the nearest number.
 */
template<int Numerator, int Denominator, int LowestExponent>
class PowerTable
{
public:
    constexpr PowerTable()
    {
        // From 1 downwards, so that each root starts out from its neighbor's.
        long double nearbyRoot = 1.0L;
        for (std::size_t i = m_places.size(); i-- > 0;) {
            const auto place = std::bit_cast<double>((firstIndex + i) << lowBits);
            nearbyRoot = root(place, nearbyRoot);
            m_places[i] = {1.0 / place, static_cast<double>(raised(nearbyRoot, Numerator))};
        }
    }

    double operator()(double x) const
    {
        const auto bits = std::bit_cast<std::uint64_t>(x);
        const std::uint64_t index = (bits + halfStep) >> lowBits;
        const Place &place = m_places[index - firstIndex];
        // The difference is exact, since both are so near each other.
        const double more = (x - std::bit_cast<double>(index << lowBits)) * place.inverse;
        const double square = more * more;
        const double series = (c1 + more * c2) + square * ((c3 + more * c4) + square * (c5 + more * c6));
        return place.power + place.power * (more * series);
    }

private:
    struct Place
    {
        double inverse;
        double power;
    };

    // 64 places for each power of two: what x is more than the nearest of them is at most 1/128 of it.
    static constexpr int indexBits = 6;
    static constexpr int lowBits = 52 - indexBits;
    static constexpr std::uint64_t halfStep = std::uint64_t(1) << (lowBits - 1);
    static constexpr std::size_t count = (static_cast<std::size_t>(-LowestExponent) << indexBits) + 1;
    static constexpr std::uint64_t firstIndex = (std::bit_cast<std::uint64_t>(1.0) >> lowBits) - (count - 1);

    // (1 + m)^exponent = 1 + c1·m + c2·m² + …; the next would add less than the last bit.
    static constexpr double exponent = static_cast<double>(Numerator) / Denominator;
    static constexpr double c1 = exponent;
    static constexpr double c2 = c1 * (exponent - 1.0) / 2.0;
    static constexpr double c3 = c2 * (exponent - 2.0) / 3.0;
    static constexpr double c4 = c3 * (exponent - 3.0) / 4.0;
    static constexpr double c5 = c4 * (exponent - 4.0) / 5.0;
    static constexpr double c6 = c5 * (exponent - 5.0) / 6.0;

    static constexpr long double raised(long double base, int times)
    {
        long double power = 1.0L;
        for (int i = 0; i < times; ++i)
            power *= base;
        return power;
    }

    /** By Newton's method, which from a neighbor's root is there in three rounds. */
    static constexpr long double root(long double x, long double start)
    {
        constexpr int rounds = 5;
        long double y = start;
        for (int i = 0; i < rounds; ++i)
            y -= (y - x / raised(y, Denominator - 1)) / Denominator;
        return y;
    }

    std::array<Place, count> m_places = {};
};

} // namespace favrin::platform
