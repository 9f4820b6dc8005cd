#pragma once

#include <algorithm>
#include <cmath>

#include <wayland-util.h>

namespace favrin::host::server {

/** @p value as the wire carries it: in 256ths, as large as fits; a number that is not finite is 0. */
inline wl_fixed_t fixedPoint(double value)
{
    constexpr double largest = 8388607.0;
    return std::isfinite(value) ? wl_fixed_from_double(std::clamp(value, -largest, largest)) : 0;
}

} // namespace favrin::host::server
