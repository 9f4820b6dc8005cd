#pragma once

#include "sliders/slidercontrolstyle.h"

namespace favrin::sliders {

/** The first run of decimal digits, of any script; none in a text without digits. */
std::optional<TextRange> numberRun(const QString &text);

/** Where a caret at @p caret has to stand so as to touch the number: the nearest place. UTF-16 units. */
qsizetype confinedCaret(const QString &text, qsizetype caret);

} // namespace favrin::sliders
