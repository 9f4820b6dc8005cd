#include "spectrum/timingcurve.h"

#include <cmath>
#include <optional>

namespace favrin::spectrum {
namespace {

constexpr float tolerance = 1e-5F;
constexpr float smallestSlope = 1e-6F;
constexpr int newtonRounds = 8;
constexpr int bisectionRounds = 1024;

std::optional<float> parameterByNewton(const TimingCurve::Polynomial &polynomial, float value)
{
    float t = value;
    for (int round = 0; round < newtonRounds; ++round) {
        const float error = polynomial.value(t) - value;
        if (std::abs(error) < tolerance)
            return t;
        const float slope = polynomial.slope(t);
        if (std::abs(slope) < smallestSlope)
            return std::nullopt;
        t = t - error / slope;
    }
    return std::nullopt;
}

float parameterByBisection(const TimingCurve::Polynomial &polynomial, float value)
{
    float low = 0.0F;
    float high = 1.0F;
    float t = value;
    for (int round = 0; round < bisectionRounds && low < high; ++round) {
        const float error = polynomial.value(t) - value;
        if (std::abs(error) < tolerance)
            break;
        // What is not a number lowers the upper bound, which ends the search.
        (error < 0.0F ? low : high) = t;
        t = static_cast<float>(low + (static_cast<double>(high) - low) * 0.5);
    }
    return t;
}

float parameter(const TimingCurve::Polynomial &polynomial, float value)
{
    if (const auto t = parameterByNewton(polynomial, value))
        return *t;
    if (value < 0.0F)
        return 0.0F;
    if (value > 1.0F)
        return 1.0F;
    return parameterByBisection(polynomial, value);
}

} // namespace

TimingCurve::Polynomial::Polynomial(float p1, float p2) : c(3.0F * p1), b(3.0F * (p2 - p1) - c), a(1.0F - c - b) {}

TimingCurve::TimingCurve(float p1x, float p1y, float p2x, float p2y) : m_x(p1x, p2x), m_y(p1y, p2y) {}

float TimingCurve::y(float x) const
{
    return m_y.value(parameter(m_x, x));
}

float TimingCurve::x(float y) const
{
    return m_x.value(parameter(m_y, y));
}

} // namespace favrin::spectrum
