#pragma once

#include "platform/color/color.h"

#include <QByteArray>
#include <QByteArrayView>

#include <optional>

/**
 * What the eyedropper service and its picking process say to each other: short lines over the picking process's
 * standard input and output. Pure functions, any thread.
 */
namespace favrin::eyedropper::pickerlines {

/** To the picking process. */
inline constexpr char floatRequest[] = "float";
inline constexpr char cancelRequest[] = "cancel";
/** From the picking process; besides these there are colors. */
inline constexpr char floated[] = "floated";

/** A line longer than this is none of ours. */
inline constexpr qsizetype longestLine = 256;

/** The line of a picked color, without its end; none for a color that must not be sent. */
std::optional<QByteArray> colorLine(const platform::Color &color);
/** The color of such a line, or none when it is not exactly one. */
std::optional<platform::Color> colorFromLine(QByteArrayView line);

} // namespace favrin::eyedropper::pickerlines
