#pragma once

namespace favrin::apps {

/**
 * Gives up what the picker does not need of its user's rights: it may write its settings only, reaches nothing over a
 * network, starts nothing, and keeps of its descriptors the standard ones and the socket to its host. What a kernel
 * cannot refuse is left as it is, which debug entries of the log say.
 *
 * For tools that must look into the process, "off" in $FAVRIN_CONFINEMENT leaves it as it was started.
 */
void confineService(int socket);

} // namespace favrin::apps
