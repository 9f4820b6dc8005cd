#pragma once

#include "model/somecolor.h"

#include <optional>
#include <string_view>

namespace favrin::model {

/**
 * The color that a text from elsewhere means, in the forms that people copy: three, four, six or eight hexadecimal
 * digits with or without "#"; rgb() and rgba() with numbers or percentages, commas or blanks; hsl(), hsla() and hwb();
 * color(srgb …) and color(display-p3 …); a CSS color name. Case does not matter; blanks, quotes and a closing ";"
 * around it are dropped.
 *
 * @param text UTF-8, of any length
 * @param hexSpace the space of bare digits. Every other form names its own (sRGB unless it says otherwise).
 * @return the color in its own space, components clipped to 0…1; none for any other text
 * Any thread.
 */
std::optional<SomeColor> colorFromCssText(std::string_view text, SomeColor::ColorSpace hexSpace);

} // namespace favrin::model
