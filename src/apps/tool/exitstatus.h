#pragma once

namespace favrin::tool {

/** How the tool says what became of its question. */
enum class ExitStatus {
    Chosen = 0,
    /** The user closed the picker without choosing. */
    Cancelled = 1,
    /** The command line is wrong; nothing was shown. */
    Usage = 2,
    /** No display, no picker process, or nowhere to write to. */
    Failed = 3,
    /** The time given to the user has passed. */
    TimedOut = 5,
};

} // namespace favrin::tool
