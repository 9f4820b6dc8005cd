#include "sliders/caretconfinement.h"

#include "sliders/textedit.h"

#include <algorithm>

namespace favrin::sliders {
namespace {

/** Units of the digit that starts at @p index; 0 where no digit starts. */
qsizetype digitLength(QStringView text, qsizetype index)
{
    const QChar unit = text[index];
    if (!unit.isHighSurrogate() || index + 1 == text.size())
        return isDecimalDigit(unit.unicode()) ? 1 : 0;
    return isDecimalDigit(QChar::surrogateToUcs4(unit, text[index + 1])) ? 2 : 0;
}

} // namespace

std::optional<TextRange> numberRun(const QString &text)
{
    qsizetype start = 0;
    while (start < text.size() && digitLength(text, start) == 0)
        ++start;
    qsizetype end = start;
    while (end < text.size() && digitLength(text, end) > 0)
        end += digitLength(text, end);
    return end > start ? std::optional(TextRange{start, end - start}) : std::nullopt;
}

qsizetype confinedCaret(const QString &text, qsizetype caret)
{
    const auto run = numberRun(text);
    return run ? std::clamp(caret, run->location, run->location + run->length) : caret;
}

} // namespace favrin::sliders
