#pragma once

#include "platform/color/color.h"

#include <QList>
#include <QString>

#include <optional>

/** A color as the eyedropper service sends it. Pure functions, any thread. */
namespace favrin::eyedropper {

/** The arguments of a color's message: the name of its space, and its components followed by its opacity. */
struct ColorArguments
{
    QString colorspace;
    QList<double> components;
};

/** None for a color without a space, or with a number that is not finite: it must not be sent. */
std::optional<ColorArguments> encodeColor(const platform::Color &color);

/**
 * None when the space is not known, the numbers are too few or too many, or one is not finite. Numbers beyond 0…1 are
 * brought back into it, except for the components of a space that reaches further.
 */
std::optional<platform::Color> decodeColor(const ColorArguments &arguments);

} // namespace favrin::eyedropper
