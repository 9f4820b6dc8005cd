#pragma once

namespace favrin::platform {

/**
 * Closes every descriptor but the standard three and @p kept, and opens /dev/null in place of a standard one that is
 * missing: the first file that is opened would take its number and receive what is meant for it.
 */
void keepOnlyDescriptor(int kept);

/** A crash leaves no picture of this process's memory behind: it holds what the user did in the host. */
void leaveNoCoreDump();

/**
 * The kernel kills this process when the thread that started it ends. For what keeps it from noticing by itself, e.g.
 * having been stopped.
 */
void endWithParent();

} // namespace favrin::platform
