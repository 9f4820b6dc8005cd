#include "sliders/integerslidercontrolstyle.h"

#include "sliders/textedit.h"

#include <QLocale>

#include <algorithm>
#include <cmath>

namespace favrin::sliders {

using platform::NumberFormatter;

namespace {

constexpr double fullScale = 255.0;
constexpr std::size_t mostDigits = 3;

const NumberFormatter &sharedFormatter()
{
    static const NumberFormatter formatter(NumberFormatter::Style::Integer, QLocale().bcp47Name().toStdString());
    return formatter;
}

bool acceptsEdit(const QString &text, TextRange range, const QString &replacement)
{
    if (!isWithin(range, text.size()))
        return false;
    const QString after = edited(text, {range, replacement});
    return after.toStdU32String().size() <= mostDigits && everyCharacter(after, isDecimalDigit);
}

} // namespace

IntegerSliderControlStyle::IntegerSliderControlStyle() : IntegerSliderControlStyle(sharedFormatter()) {}

IntegerSliderControlStyle::IntegerSliderControlStyle(const NumberFormatter &formatter)
{
    floatToTextMapping = [&formatter](double value) {
        return QString::fromStdU16String(formatter.string(std::round(value * fullScale)).value_or(std::u16string()));
    };
    textToFloatMapping = [&formatter](const QString &text) -> std::optional<double> {
        const auto number = formatter.number(text.toStdU16String());
        return number ? std::optional(std::clamp(std::trunc(*number) / fullScale, 0.0, 1.0)) : std::nullopt;
    };
    shouldChangeCharacters = acceptsEdit;
}

} // namespace favrin::sliders
