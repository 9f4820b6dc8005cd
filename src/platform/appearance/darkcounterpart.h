#pragma once

#include "platform/color/color.h"

namespace favrin::platform {

enum class Appearance { Light, Dark };

/**
 * The counterpart of a picker color in another appearance: a pure function, usable on any thread.
 *
 * From light to dark the color keeps its hue and stays recognisable, and keeps its contrast against a dark background
 * where it had contrast against a light one. Any other pair of appearances returns the color unchanged. The result is
 * in sRGB with the alpha of @p color.
 */
Color convertColor(const Color &color, Appearance source, Appearance target);

} // namespace favrin::platform
