#pragma once

namespace favrin::remote {

/**
 * A color on its way from the service's clipboard to the host's: red, green, blue and opacity in sRGB, 16 bits each, in
 * the byte order of the machine. The toolkit's own way to send a color would lose its opacity.
 */
inline constexpr const char *colorClipboardType = "application/x-favrin-color";

} // namespace favrin::remote
