#pragma once

namespace favrin::shell {

/** Lets assistive technologies see a ColorWell as a picture whose value is the name of its color. May be repeated. */
void installAccessibleColorWell();

} // namespace favrin::shell
