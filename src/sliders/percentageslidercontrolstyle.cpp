#include "sliders/percentageslidercontrolstyle.h"

#include "sliders/textedit.h"

#include <QLocale>

#include <algorithm>
#include <cmath>

namespace favrin::sliders {

using platform::NumberFormatter;

namespace {

const NumberFormatter &sharedFormatter()
{
    static const NumberFormatter formatter(NumberFormatter::Style::Percent, QLocale().bcp47Name().toStdString());
    return formatter;
}

const NumberFormatter &sharedParser()
{
    static const NumberFormatter parser(NumberFormatter::Style::Integer, QLocale().bcp47Name().toStdString());
    return parser;
}

std::u32string digitsOf(const QString &text)
{
    std::u32string digits = text.toStdU32String();
    std::erase_if(digits, [](char32_t character) { return !isDecimalDigit(character); });
    return digits;
}

std::u32string symbolOf(const NumberFormatter &formatter)
{
    return QString::fromStdU16String(formatter.percentSymbol()).toStdU32String();
}

bool isBlank(char32_t character)
{
    return character == U'\t' || QChar::category(character) == QChar::Separator_Space;
}

} // namespace

PercentageSliderControlStyle::PercentageSliderControlStyle()
    : PercentageSliderControlStyle(sharedFormatter(), sharedParser())
{
}

PercentageSliderControlStyle::PercentageSliderControlStyle(const NumberFormatter &formatter,
                                                           const NumberFormatter &parser)
{
    floatToTextMapping = [&formatter](double value) {
        return QString::fromStdU16String(formatter.string(value).value_or(std::u16string()));
    };
    textToFloatMapping = [&parser](const QString &text) -> std::optional<double> {
        const auto number = parser.number(QString::fromStdU32String(digitsOf(text)).toStdU16String());
        return number ? std::optional(std::clamp(std::trunc(*number) / 100.0, 0.0, 1.0)) : std::nullopt;
    };
    const auto isAllowed = [symbol = symbolOf(formatter)](char32_t character) {
        return isDecimalDigit(character) || isBlank(character) || symbol.find(character) != std::u32string::npos;
    };
    shouldChangeCharacters = [isAllowed](const QString &text, TextRange range, const QString &replacement) {
        // The locale writes its percentages with something else as well: no edit of such a text can be judged.
        if (!everyCharacter(text, isAllowed))
            return true;
        return isWithin(range, text.size()) && everyCharacter(edited(text, {range, replacement}), isAllowed);
    };
}

} // namespace favrin::sliders
