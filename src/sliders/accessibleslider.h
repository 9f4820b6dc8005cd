#pragma once

namespace favrin::sliders {

/**
 * Lets assistive technologies see a CPSlider as one slider, whose value they read, set and step. The value is on the
 * scale of the text that the field beside it shows: 0 to 255, or percent. Repeated calls do nothing.
 */
void installAccessibleSlider();

} // namespace favrin::sliders
