#pragma once

#include <string>

#include <sys/types.h>

/**
 * Starting the picker's program. Without Qt and without a server: the tool does it before it loads either, since the
 * picker needs longer to start than anything else does. Any thread.
 */
namespace favrin::host {

/** A process that was started, and our end of its socket. Whoever holds it owns both. */
struct LaunchedService
{
    /** 0 when it could not be started. */
    pid_t process = 0;
    /** Close-on-exec; -1 when there is none. */
    int socket = -1;
    /** Why it could not be started, else empty. */
    std::string error;
};

/** The program that is run: "$FAVRIN_COLOR_PICKER_SERVICE", else beside this library or program, else as installed. */
std::string servicePath();

/** Starts @p program with one end of a new socket pair as its only connection, and an explicit list of variables. */
LaunchedService launchService(const std::string &program);

} // namespace favrin::host
