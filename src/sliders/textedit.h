#pragma once

#include "sliders/slidercontrolstyle.h"

#include <functional>

namespace favrin::sliders {

/** One change of a text: a range of it and what takes its place. */
struct TextEdit
{
    TextRange range;
    QString replacement;

    bool operator==(const TextEdit &) const = default;
};

/** Whether the range lies within a text of @p length units. */
bool isWithin(TextRange range, qsizetype length);

/** @p text after the edit, whose range must lie within it. */
QString edited(const QString &text, const TextEdit &edit);

/**
 * The edit that made @p before into @p after.
 * @param selection what was selected before, empty for a caret; where it can have been what was replaced, it was.
 * Otherwise the smallest edit that explains the change.
 */
TextEdit editBetween(const QString &before, TextRange selection, const QString &after);

/** Whether every character (code point) of the text satisfies @p allowed. */
bool everyCharacter(const QString &text, const std::function<bool(char32_t)> &allowed);

/** A decimal digit of any script. */
bool isDecimalDigit(char32_t character);

} // namespace favrin::sliders
