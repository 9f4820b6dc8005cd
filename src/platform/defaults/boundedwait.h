#pragma once

#include <chrono>

/**
 * SQLite's access to files, whose own waits end at a deadline.
 *
 * Most of its waits for other processes go through a handler of the connection's. Some do not: while another process
 * makes the index of the write-ahead log, SQLite sleeps and tries again by itself, for ten seconds in all.
 */
namespace favrin::platform::boundedwait {

/** The name under which SQLite knows these files; null, for its usual ones, when it cannot learn it. */
const char *fileSystem();

/** From when on nothing on this thread sleeps any more. */
void setDeadline(std::chrono::steady_clock::time_point deadline);

} // namespace favrin::platform::boundedwait
