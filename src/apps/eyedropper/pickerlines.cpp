#include "apps/eyedropper/pickerlines.h"

#include "eyedropper/eyedroppercolor.h"

#include <QLocale>

namespace favrin::eyedropper::pickerlines {

namespace {

constexpr char colorWord[] = "color";

} // namespace

std::optional<QByteArray> colorLine(const platform::Color &color)
{
    const auto arguments = encodeColor(color);
    if (!arguments)
        return std::nullopt;
    QByteArrayList words = {colorWord, arguments->colorspace.toUtf8()};
    for (const double number : arguments->components)
        words << QByteArray::number(number, 'g', QLocale::FloatingPointShortest);
    return words.join(' ');
}

std::optional<platform::Color> colorFromLine(QByteArrayView line)
{
    if (line.size() > longestLine)
        return std::nullopt;
    const QByteArrayList words = line.toByteArray().split(' ');
    if (words.size() < 3 || words[0] != colorWord)
        return std::nullopt;
    ColorArguments arguments = {.colorspace = QString::fromUtf8(words[1]), .components = {}};
    for (const QByteArray &word : words.sliced(2)) {
        bool isNumber = false;
        arguments.components << word.toDouble(&isNumber);
        if (!isNumber)
            return std::nullopt;
    }
    return decodeColor(arguments);
}

} // namespace favrin::eyedropper::pickerlines
