#include "sliders/textedit.h"

#include <algorithm>
#include <string>

namespace favrin::sliders {

bool isWithin(TextRange range, qsizetype length)
{
    return range.location >= 0 && range.length >= 0 && range.location <= length &&
           range.length <= length - range.location;
}

QString edited(const QString &text, const TextEdit &edit)
{
    return QString(text).replace(edit.range.location, edit.range.length, edit.replacement);
}

TextEdit editBetween(const QString &before, TextRange selection, const QString &after)
{
    const auto between = [&](qsizetype start, qsizetype rest) {
        return TextEdit{{start, before.size() - start - rest}, after.mid(start, after.size() - start - rest)};
    };
    if (isWithin(selection, before.size())) {
        const qsizetype rest = before.size() - selection.location - selection.length;
        if (after.size() >= selection.location + rest &&
            after.startsWith(QStringView(before).left(selection.location)) &&
            after.endsWith(QStringView(before).right(rest)))
            return between(selection.location, rest);
    }
    const qsizetype shorter = std::min(before.size(), after.size());
    qsizetype start = 0;
    while (start < shorter && before[start] == after[start])
        ++start;
    qsizetype rest = 0;
    while (rest < shorter - start && before[before.size() - 1 - rest] == after[after.size() - 1 - rest])
        ++rest;
    return between(start, rest);
}

bool everyCharacter(const QString &text, const std::function<bool(char32_t)> &allowed)
{
    const std::u32string characters = text.toStdU32String();
    return std::all_of(characters.begin(), characters.end(), allowed);
}

bool isDecimalDigit(char32_t character)
{
    return QChar::category(character) == QChar::Number_DecimalDigit;
}

} // namespace favrin::sliders
