#pragma once

#include <string>

namespace favrin::host {

/**
 * The keymap of the host's keyboard as an XKB text: asked of the X server or of the compositor that the host runs
 * under. Empty where neither tells it; the default keymap is then the right one. GUI thread; asked once per process.
 */
std::string hostKeymap();

} // namespace favrin::host
