#include "platform/confinement/inheritance.h"

#include <csignal>

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace favrin::platform {

namespace {

void closeRange(unsigned first, unsigned last)
{
    if (first > last || ::syscall(SYS_close_range, first, last, 0) == 0)
        return;
    const long most = ::sysconf(_SC_OPEN_MAX);
    for (unsigned descriptor = first; descriptor <= last && static_cast<long>(descriptor) < most; ++descriptor)
        ::close(static_cast<int>(descriptor));
}

} // namespace

void keepOnlyDescriptor(int kept)
{
    const auto number = static_cast<unsigned>(kept);
    if (kept > STDERR_FILENO) {
        closeRange(STDERR_FILENO + 1, number - 1);
        closeRange(number + 1, ~0U);
    } else {
        closeRange(STDERR_FILENO + 1, ~0U);
    }
    for (int standard = STDIN_FILENO; standard <= STDERR_FILENO; ++standard) {
        if (::fcntl(standard, F_GETFD) < 0)
            // Takes the lowest number that is free, which is this one.
            static_cast<void>(::open("/dev/null", standard == STDIN_FILENO ? O_RDONLY : O_WRONLY));
    }
}

void leaveNoCoreDump()
{
    // One byte, not none: programs that receive dumps through a pipe are started whatever the limit is, except for this
    // value. Hiding the process altogether (PR_SET_DUMPABLE) would hide it from its host and from debuggers, too.
    constexpr rlimit limit = {1, 1};
    ::setrlimit(RLIMIT_CORE, &limit);
}

void endWithParent()
{
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
}

} // namespace favrin::platform
