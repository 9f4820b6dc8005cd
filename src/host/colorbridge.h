#pragma once

#include "host/fvcolor.h"
#include "platform/color/color.h"

#include <optional>

/** Between the public color, Qt's colors, and the platform colors that travel. Pure functions, any thread. */
namespace favrin::host {

/** None for no color. */
std::optional<platform::Color> toPlatformColor(const FVColor &color);
/** No color for none. A color without a space is read as sRGB; gray and spaces without a name become linear sRGB. */
FVColor toPublicColor(const std::optional<platform::Color> &color);
/** A Qt color space as one of ours; none for a space that Qt itself cannot describe. */
std::optional<platform::ColorSpace> toPlatformColorSpace(const QColorSpace &space);

} // namespace favrin::host
