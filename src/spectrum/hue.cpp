#include "spectrum/hue.h"

#include "spectrum/timingcurve.h"

#include <algorithm>
#include <cmath>

namespace favrin::spectrum {
namespace {

constexpr float sixth = 1.0F / 6.0F;
constexpr float angleTolerance = 0.001F;
constexpr int searchRounds = 100;
/** Keeps the hue angle of the bottom edge below the 360 degrees that would be the 0 of the top edge. */
constexpr double smallestBottomBlue = 1.0 / 255.0;

const TimingCurve &hueRampCurve()
{
    static const TimingCurve curve(0.47F, 0.0F, 0.68F, 1.0F);
    return curve;
}

float ramp(double t)
{
    return hueRampCurve().y(static_cast<float>(t));
}

} // namespace

FieldColor hueColor(float y)
{
    const float h = static_cast<float>(0.5 - 0.5 * static_cast<double>(y));
    const double position = h;
    const double bound = sixth;
    if (position < bound)
        return {1.0F, ramp(6.0F * h), 0.0F};
    if (position < 2.0 * bound)
        return {ramp(1.0 - (6.0 * position - 1.0)), 1.0F, 0.0F};
    if (position < 3.0 * bound)
        return {0.0F, 1.0F, ramp(6.0 * position - 2.0)};
    if (position < 4.0 * bound)
        return {0.0F, ramp(1.0 - (6.0 * position - 3.0)), 1.0F};
    if (position < 5.0 * bound)
        return {ramp(6.0 * position - 4.0), 0.0F, 1.0F};
    const double blue = ramp(1.0 - (6.0 * position - 5.0));
    return {1.0F, 0.0F, static_cast<float>(std::fmax(blue, smallestBottomBlue))};
}

float hueAngle(float r, float g, float b)
{
    float q = 0.0F;
    if (r >= g && r >= b)
        q = (g - b) / (r - std::min(g, b));
    else if (g >= r && g >= b)
        q = (b - r) / (g - std::min(r, b)) + 2.0F;
    else if (b >= r && b >= g)
        q = (r - g) / (b - std::min(r, g)) + 4.0F;
    else
        return 0.0F;
    while (q < 0.0F)
        q += 6.0F;
    return 60.0F * q;
}

float huePosition(float target)
{
    float y = 0.0F;
    float step = 0.5F;
    for (int round = 0; round < searchRounds; ++round) {
        const FieldColor color = hueColor(y);
        const float angle = hueAngle(color.r, color.g, color.b);
        if (std::abs(target - angle) < angleTolerance)
            return y;
        const float next = target < angle ? y + step : y - step;
        // Too small a step to move: neither would any of the following, which are smaller still.
        if (next == y)
            return y;
        y = next;
        step /= 2.0F;
    }
    return y;
}

} // namespace favrin::spectrum
