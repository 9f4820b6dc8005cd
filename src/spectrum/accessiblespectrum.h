#pragma once

#include <QAccessible>
#include <QString>

namespace favrin::spectrum {

class Spectrum;

/**
 * Lets assistive technologies see a Spectrum as one element, whose value is the name of its color, with the two axes of
 * the field as sliders. Their objects are made when somebody asks for them. Repeated calls do nothing.
 */
void installAccessibleSpectrum();

/** Has assistive technologies say @p text about the spectrum. */
void announce(Spectrum &spectrum, const QString &text);

} // namespace favrin::spectrum
