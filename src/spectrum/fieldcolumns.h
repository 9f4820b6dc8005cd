#pragma once

#include "spectrum/spectrummapping.h"

#include <span>
#include <vector>

namespace favrin::spectrum {

/**
 * The lightness of each column, brought to one form for both halves: component' = base + (component - base)·factor,
 * where base is 1 for a tint and 0 for a shade. Hues have a largest component of 1, so that this is what shaded() does.
 */
struct FieldColumns
{
    explicit FieldColumns(std::span<const float> locations)
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

/** A component of a hue at the lightness of a column. */
inline float lit(float component, float base, float factor)
{
    return base + (component - base) * factor;
}

} // namespace favrin::spectrum
