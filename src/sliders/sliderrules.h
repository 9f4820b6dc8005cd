#pragma once

#include "model/somecolor.h"

#include <QPointF>
#include <QSizeF>
#include <qnamespace.h>

#include <optional>
#include <utility>

/** Where the thumb of a track stands, which value a location means and what the track shows: plain functions. */
namespace favrin::sliders {

/** Height of every track, in points. The thumb is as wide: half of it is kept free at each end of the track. */
inline constexpr double trackHeight = 36.0;

/**
 * The value, 0…1, that a touch at @p x means on a track of @p size. @p x counts from the left edge, also on a mirrored
 * track, where the value grows to the left. A track no wider than high has but the value 0.
 */
double valueAt(double x, QSizeF size, Qt::LayoutDirection direction);

/** Center of the thumb on a track of @p size. */
QPointF thumbCenter(double value, QSizeF size, Qt::LayoutDirection direction);

/**
 * The colors at the leading and the trailing end of a component's track: the selected color, opaque (black while none
 * is selected), with the component at 0 and at 1.
 */
std::pair<model::SomeColor, model::SomeColor> gradientStops(const std::optional<model::SomeColor> &selectedColor,
                                                            model::SomeColor::Component component);

/** What assistive technologies and the page keys step by, within 0 to 1. */
double incremented(double value);
double decremented(double value);

/** How many steps the component's text field tells apart between 0 and 1. */
int shownSteps(model::SomeColor::Component component);

} // namespace favrin::sliders
