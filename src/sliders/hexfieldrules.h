#pragma once

#include "model/somecolor.h"
#include "sliders/textedit.h"

namespace favrin::sliders {

/** What may be typed into the hex field: up to six ASCII hexadecimal digits and nothing else. */
bool acceptsHexEdit(const QString &text, TextRange range, const QString &replacement);

/**
 * The edit to make in the hex field in place of @p edit, when that brings in a whole color as people copy it: its six
 * digits where it was put if there is room for them, as it is if it may be typed so, otherwise the six digits in place
 * of all text. Any other edit is returned as it is.
 * @param colorSpace the space of the field's digits; a color that names another space is converted
 */
TextEdit withColorAsDigits(const QString &text, const TextEdit &edit, model::SomeColor::ColorSpace colorSpace);

} // namespace favrin::sliders
