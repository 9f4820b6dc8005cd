#include "turnedclock.h"

#include <atomic>
#include <cstdlib>

#include <fcntl.h>
#include <sys/mman.h>
#include <sys/syscall.h>
#include <sys/time.h>
#include <time.h>
#include <unistd.h>

namespace {

using Seconds = std::atomic<long long>;

constexpr const char *variable = "FAVRIN_TEST_CLOCK";

/** None as long as no clock is named: libraries ask for the time before a test begins. */
Seconds *sharedTurn()
{
    static std::atomic<Seconds *> shared = nullptr;
    const char *name = shared ? nullptr : std::getenv(variable);
    const int file = name ? ::open(name, O_RDWR | O_CLOEXEC) : -1;
    if (file >= 0) {
        void *page = ::mmap(nullptr, sizeof(Seconds), PROT_READ | PROT_WRITE, MAP_SHARED, file, 0);
        ::close(file);
        if (page != MAP_FAILED)
            shared = static_cast<Seconds *>(page);
    }
    return shared;
}

timespec wallTime()
{
    timespec time = {};
    ::syscall(SYS_clock_gettime, CLOCK_REALTIME, &time);
    if (const Seconds *turn = sharedTurn())
        time.tv_sec += static_cast<time_t>(turn->load());
    return time;
}

} // namespace

TurnedClock::TurnedClock(const char *file)
{
    const int descriptor = ::open(file, O_RDWR | O_CREAT | O_CLOEXEC, 0600);
    static_cast<void>(!::ftruncate(descriptor, sizeof(Seconds)));
    ::close(descriptor);
    ::setenv(variable, file, 1);
}

void TurnedClock::turn(long long seconds)
{
    if (Seconds *turn = sharedTurn())
        *turn = seconds;
}

// Seen by all libraries, which take these for the C library's.
#pragma GCC visibility push(default)
extern "C" {

// NOLINTBEGIN(bugprone-easily-swappable-parameters): the C library's own
int clock_gettime(clockid_t clock, timespec *time) noexcept
{
    if (clock != CLOCK_REALTIME && clock != CLOCK_REALTIME_COARSE)
        return static_cast<int>(::syscall(SYS_clock_gettime, clock, time));
    *time = wallTime();
    return 0;
}

int gettimeofday(timeval *time, void *) noexcept
{
    const timespec now = wallTime();
    *time = {now.tv_sec, now.tv_nsec / 1000};
    return 0;
}

time_t time(time_t *result) noexcept
{
    const time_t now = wallTime().tv_sec;
    if (result)
        *result = now;
    return now;
}
// NOLINTEND(bugprone-easily-swappable-parameters)
}
#pragma GCC visibility pop
