#pragma once

#include <QString>

#include <functional>
#include <optional>

namespace favrin::sliders {

/** A part of a text, in UTF-16 units. */
struct TextRange
{
    qsizetype location = 0;
    qsizetype length = 0;

    bool operator==(const TextRange &) const = default;
};

/** Whether a text may have @p range replaced by @p replacement. */
using EditFilter = std::function<bool(const QString &text, TextRange range, const QString &replacement)>;

/** How a component, 0…1, is shown in a text field, what a typed text means and what may be typed. */
struct SliderControlStyle
{
    /** Empty where the locale has no text for the value. */
    std::function<QString(double)> floatToTextMapping;
    /** None for a text that is no value; what is out of range comes out clipped to 0…1. */
    std::function<std::optional<double>(const QString &)> textToFloatMapping;
    EditFilter shouldChangeCharacters;
};

} // namespace favrin::sliders
