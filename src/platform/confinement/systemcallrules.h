#pragma once

namespace favrin::platform {

/**
 * Makes the system calls fail that nobody needs who draws and keeps settings: everything about the network, new
 * processes, other processes, mounts, and owners and modes of files. 0, or the error that kept it from it.
 *
 * It names what is refused, not what is allowed: libraries and drivers of other systems may need calls that are unknown
 * here, and must go on working.
 */
int applySystemCallRules();

} // namespace favrin::platform
