#include "platform/confinement/confinement.h"

#include "platform/confinement/filerules.h"
#include "platform/confinement/systemcallrules.h"

#include <array>
#include <cerrno>
#include <cstdint>
#include <cstring>

#include <linux/capability.h>
#include <sys/prctl.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace favrin::platform {

namespace {

void note(std::string &missing, const char *what, int error)
{
    if (error == 0)
        return;
    if (!missing.empty())
        missing += "; ";
    missing += std::string(what) + ": " + std::strerror(error);
}

/**
 * Root may do more than others, such as reading the environment of its processes in spite of the rules for files. Of
 * all that only the way to settings that lie in somebody else's folder is left.
 */
int renounceCapabilities()
{
    constexpr std::uint32_t kept = 1U << CAP_DAC_OVERRIDE;
    __user_cap_header_struct header = {_LINUX_CAPABILITY_VERSION_3, 0};
    std::array<__user_cap_data_struct, _LINUX_CAPABILITY_U32S_3> sets = {};
    if (::syscall(SYS_capget, &header, sets.data()) != 0)
        return errno;
    const std::uint32_t left = sets[0].permitted & kept;
    sets = {__user_cap_data_struct{.effective = left, .permitted = left, .inheritable = 0}};
    return ::syscall(SYS_capset, &header, sets.data()) == 0 ? 0 : errno;
}

} // namespace

ConfinementResult confine(const Confinement &confinement)
{
    ConfinementResult result;
    // Without this the kernel lets only privileged processes confine themselves.
    if (::prctl(PR_SET_NO_NEW_PRIVS, 1, 0, 0, 0) != 0) {
        note(result.missing, "renouncing privileges", errno);
        return result;
    }
    note(result.missing, "renouncing capabilities", renounceCapabilities());
    const int files = applyFileRules(confinement);
    note(result.missing, "file rules", files);
    result.filesAreConfined = files == 0;
    const int systemCalls = applySystemCallRules();
    note(result.missing, "system call filter", systemCalls);
    result.systemCallsAreFiltered = systemCalls == 0;
    return result;
}

} // namespace favrin::platform
