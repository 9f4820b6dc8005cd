#include "platform/confinement/confinement.h"

#include "platform/confinement/filerules.h"
#include "platform/confinement/systemcallrules.h"

#include <cerrno>
#include <cstring>

#include <sys/prctl.h>

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

} // namespace

ConfinementResult confine(const Confinement &confinement)
{
    ConfinementResult result;
    // Without this the kernel lets only privileged processes confine themselves.
    if (::prctl(PR_SET_NO_NEW_PRIVS, 1, 0, 0, 0) != 0) {
        note(result.missing, "renouncing privileges", errno);
        return result;
    }
    const int files = applyFileRules(confinement);
    note(result.missing, "file rules", files);
    result.filesAreConfined = files == 0;
    const int systemCalls = applySystemCallRules();
    note(result.missing, "system call filter", systemCalls);
    result.systemCallsAreFiltered = systemCalls == 0;
    return result;
}

} // namespace favrin::platform
