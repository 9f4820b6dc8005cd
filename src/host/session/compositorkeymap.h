#pragma once

#include <string>

struct wl_display;

namespace favrin::host {

/**
 * The XKB keymap that the compositor behind @p display gives its keyboard, as text; empty when it has no seat or its
 * seat has no keyboard, as on a tablet. Asks on a queue of its own, so that nothing of the toolkit's is dispatched
 * meanwhile.
 */
std::string compositorKeymap(wl_display *display);

} // namespace favrin::host
