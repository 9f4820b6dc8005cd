#pragma once

namespace favrin::platform {

/** What the display can show: 0 the sRGB gamut, non-zero a wide gamut (Display P3). */
enum class DisplayGamut { SRGB = 0, P3 = 1 };

/**
 * The gamut of the display that this process shows its interface on; sRGB until somebody who knows says otherwise.
 * Whoever starts the interface sets it before the first color is made. Thread-safe.
 */
DisplayGamut displayGamut();
void setDisplayGamut(DisplayGamut gamut);

} // namespace favrin::platform
