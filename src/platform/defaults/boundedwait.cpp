#include "platform/defaults/boundedwait.h"

#include <sqlite3.h>

#include <algorithm>
#include <thread>

namespace favrin::platform::boundedwait {

namespace {

using Clock = std::chrono::steady_clock;

constexpr const char *name = "favrin";

thread_local Clock::time_point deadline;

int sleepUntilDeadline(sqlite3_vfs *, int microseconds)
{
    const auto asked = Clock::now() + std::chrono::microseconds(microseconds);
    std::this_thread::sleep_until(std::min(asked, deadline));
    return microseconds;
}

bool registerFileSystem()
{
    const sqlite3_vfs *usual = sqlite3_vfs_find(nullptr);
    if (!usual)
        return false;
    static sqlite3_vfs bounded = *usual;
    bounded.pNext = nullptr;
    bounded.zName = name;
    bounded.xSleep = sleepUntilDeadline;
    return sqlite3_vfs_register(&bounded, 0) == SQLITE_OK;
}

} // namespace

const char *fileSystem()
{
    static const bool isRegistered = registerFileSystem();
    return isRegistered ? name : nullptr;
}

void setDeadline(Clock::time_point next)
{
    deadline = next;
}

} // namespace favrin::platform::boundedwait
