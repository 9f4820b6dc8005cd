#pragma once

#include "platform/color/color.h"

namespace favrin::platform {

enum class Appearance { Light, Dark };

/**
 * The counterpart of a color in another appearance: a pure function, usable on any thread.
 *
 * From light to dark a color stays recognisable: hue and order of lightness are kept, black and white are what they
 * are, grays stay neutral. Deep colors rise above a dark background, pale tints come down a little so that their hue
 * shows. Colors that are easy to tell apart stay so, and close ones stay close. The result is in sRGB, inside its
 * gamut, with the alpha of @p color; a color outside sRGB is clipped first. Any other pair of appearances returns the
 * color unchanged, and so does a color without a space or with a component that is not a number.
 */
Color convertColor(const Color &color, Appearance source, Appearance target);

} // namespace favrin::platform
