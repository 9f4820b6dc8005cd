#pragma once

#include "spectrum/fieldcolor.h"

namespace favrin::spectrum {

// Strict single precision, pure, any thread.

/** The pure hue at the height @p y of the field; its largest component is 1. */
FieldColor hueColor(float y);

/** The hue angle of a color in degrees, 0…360. Not a number for a gray; 0 where a component is not a number. */
float hueAngle(float r, float g, float b);

/**
 * The height of the field whose hue has the angle @p target, to within 0.001 degrees; found by halving steps, up to 100
 * of them. -1 for an angle that is not a number.
 */
float huePosition(float target);

} // namespace favrin::spectrum
