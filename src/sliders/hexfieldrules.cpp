#include "sliders/hexfieldrules.h"

#include "model/csscolor.h"
#include "model/hexcolor.h"

#include <algorithm>

namespace favrin::sliders {
namespace {

constexpr qsizetype mostDigits = 6;
constexpr QStringView hexDigits = u"0123456789abcdefABCDEF";

} // namespace

bool acceptsHexEdit(const QString &text, TextRange range, const QString &replacement)
{
    if (!isWithin(range, text.size()))
        return false;
    const QString after = edited(text, {range, replacement});
    return after.size() <= mostDigits &&
           std::all_of(after.begin(), after.end(), [](QChar character) { return hexDigits.contains(character); });
}

TextEdit withColorAsDigits(const QString &text, const TextEdit &edit, model::SomeColor::ColorSpace colorSpace)
{
    // A typed character is no color.
    if (edit.replacement.size() < 2)
        return edit;
    const auto color = model::colorFromCssText(edit.replacement.toStdString(), colorSpace);
    if (!color)
        return edit;
    const QString digits = QString::fromStdString(model::hexString(color->converted(colorSpace)));
    if (acceptsHexEdit(text, edit.range, digits))
        return {edit.range, digits};
    if (acceptsHexEdit(text, edit.range, edit.replacement))
        return edit;
    return {{0, text.size()}, digits};
}

} // namespace favrin::sliders
