#pragma once

#include "platform/color/colorspace.h"

namespace favrin::platform {

/**
 * Conversion between the two standard-range RGB spaces, free of allocation and locks. Input and result are encoded
 * components; the result is clipped to 0…1. Neutral colors stay neutral to the last bit, and a color inside both
 * gamuts survives a round trip to within a few bits. Of components in 0…1 the result is within 5e-15 of the exact one.
 * A component that is not finite makes the result meaningless (but never undefined): callers that cannot rule it out
 * check first.
 *
 * Many colors are converted one by one: each takes less than half of what the six powers of the formula take.
 */
Triple convertedDisplayP3ToSRGB(const Triple &encoded);
Triple convertedSRGBToDisplayP3(const Triple &encoded);

/** Linear light of one encoded component on the sRGB curve; below zero the curve goes on as its straight part. */
double decodedSRGB(double encoded);
/** The same curve made odd, for extended-range spaces: the decoded value of -x is minus that of x. */
double decodedExtendedSRGB(double encoded);
/** The encoded component of linear light on the sRGB curve, clipped to 0…1 (a value that is not a number stays so). */
double encodedSRGB(double linear);

/** Linear Display P3 to linear sRGB and back, unclipped. */
Triple linearDisplayP3ToLinearSRGB(const Triple &linear);
Triple linearSRGBToLinearDisplayP3(const Triple &linear);

} // namespace favrin::platform
