#include "platform/confinement/systemcallrules.h"

#include <cerrno>
#include <initializer_list>
#include <memory>

#include <sched.h>
#include <seccomp.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <unistd.h>

namespace favrin::platform {

namespace {

// Reports of sanitizers are made by processes that they start and that look into this one.
#ifdef FAVRIN_SANITIZED
constexpr bool processesAreRefused = false;
#else
constexpr bool processesAreRefused = true;
#endif

constexpr std::initializer_list<int> aboutProcesses = {
    SCMP_SYS(execve),
    SCMP_SYS(execveat),
    SCMP_SYS(fork),
    SCMP_SYS(vfork),
    SCMP_SYS(ptrace),
    SCMP_SYS(process_vm_readv),
    SCMP_SYS(tkill),
    SCMP_SYS(process_vm_writev),
    SCMP_SYS(pidfd_send_signal),
    SCMP_SYS(pidfd_getfd),
    SCMP_SYS(process_madvise),
    SCMP_SYS(kcmp),
    SCMP_SYS(migrate_pages),
    SCMP_SYS(move_pages),
    SCMP_SYS(perf_event_open),
    SCMP_SYS(unshare),
    SCMP_SYS(setns),
    SCMP_SYS(personality),
};

constexpr std::initializer_list<int> aboutTheSystem = {
    SCMP_SYS(acct),
    SCMP_SYS(add_key),
    SCMP_SYS(adjtimex),
    SCMP_SYS(bpf),
    SCMP_SYS(chroot),
    SCMP_SYS(clock_adjtime),
    SCMP_SYS(clock_settime),
    SCMP_SYS(delete_module),
    SCMP_SYS(fanotify_init),
    SCMP_SYS(finit_module),
    SCMP_SYS(fsmount),
    SCMP_SYS(fsopen),
    SCMP_SYS(fspick),
    SCMP_SYS(init_module),
    SCMP_SYS(io_uring_enter),
    SCMP_SYS(io_uring_register),
    SCMP_SYS(io_uring_setup),
    SCMP_SYS(ioperm),
    SCMP_SYS(iopl),
    SCMP_SYS(kexec_file_load),
    SCMP_SYS(kexec_load),
    SCMP_SYS(keyctl),
    SCMP_SYS(mount),
    SCMP_SYS(mount_setattr),
    SCMP_SYS(move_mount),
    SCMP_SYS(name_to_handle_at),
    SCMP_SYS(open_by_handle_at),
    SCMP_SYS(open_tree),
    SCMP_SYS(pivot_root),
    SCMP_SYS(quotactl),
    SCMP_SYS(reboot),
    SCMP_SYS(request_key),
    SCMP_SYS(sethostname),
    SCMP_SYS(settimeofday),
    SCMP_SYS(swapoff),
    SCMP_SYS(swapon),
    SCMP_SYS(syslog),
    SCMP_SYS(umount2),
    SCMP_SYS(userfaultfd),
    SCMP_SYS(vhangup),
};

/** Rules for files do not cover these. What opens a file for writing is for them to judge. */
constexpr std::initializer_list<int> aboutFiles = {
    SCMP_SYS(chmod),    SCMP_SYS(chown),        SCMP_SYS(fchmod),    SCMP_SYS(fchmodat),    SCMP_SYS(fchown),
    SCMP_SYS(fchownat), SCMP_SYS(fremovexattr), SCMP_SYS(fsetxattr), SCMP_SYS(futimesat),   SCMP_SYS(lchown),
    SCMP_SYS(listen),   SCMP_SYS(lremovexattr), SCMP_SYS(lsetxattr), SCMP_SYS(removexattr), SCMP_SYS(setxattr),
    SCMP_SYS(truncate), SCMP_SYS(truncate64),   SCMP_SYS(utime),     SCMP_SYS(utimensat),   SCMP_SYS(utimes),
};

scmp_arg_cmp differs(unsigned argument, scmp_datum_t value)
{
    return {argument, SCMP_CMP_NE, value, 0};
}

scmp_arg_cmp hasBits(unsigned argument, scmp_datum_t mask, scmp_datum_t value)
{
    return {argument, SCMP_CMP_MASKED_EQ, mask, value};
}

/** A row of refusals that remembers the first one that could not be made. */
class Filter
{
public:
    Filter() : m_context(seccomp_init(SCMP_ACT_ALLOW))
    {
        if (!m_context)
            m_error = ENOMEM;
    }

    void refuse(std::initializer_list<int> calls)
    {
        for (const int call : calls)
            refuse(call, EPERM, {});
    }

    void refuse(int call, int error, std::initializer_list<scmp_arg_cmp> when)
    {
        if (m_error == 0)
            m_error = -seccomp_rule_add_array(m_context.get(), SCMP_ACT_ERRNO(static_cast<unsigned>(error)), call,
                                              static_cast<unsigned>(when.size()), when.begin());
    }

    int load()
    {
        if (m_error == 0)
            m_error = -seccomp_load(m_context.get());
        return m_error;
    }

private:
    struct Release
    {
        void operator()(void *context) const { seccomp_release(context); }
    };

    std::unique_ptr<void, Release> m_context;
    int m_error = 0;
};

void refuseProcesses(Filter &filter)
{
    filter.refuse(aboutProcesses);
    // Its flags are in memory, where no filter sees them: the C library then makes its threads by clone().
    filter.refuse(SCMP_SYS(clone3), ENOSYS, {});
    filter.refuse(SCMP_SYS(clone), EPERM, {hasBits(0, CLONE_THREAD, 0)});
    // To itself a process may send signals: abort() does.
    const auto self = static_cast<scmp_datum_t>(::getpid());
    for (const int call : {SCMP_SYS(kill), SCMP_SYS(tgkill), SCMP_SYS(rt_sigqueueinfo), SCMP_SYS(rt_tgsigqueueinfo)})
        filter.refuse(call, EPERM, {differs(0, self)});
}

} // namespace

int applySystemCallRules()
{
    Filter filter;
    filter.refuse(aboutTheSystem);
    filter.refuse(aboutFiles);
    filter.refuse(SCMP_SYS(socket), EAFNOSUPPORT, {differs(0, AF_UNIX)});
    // Both put words into the mouth of whoever sits at a terminal that was inherited.
    for (const scmp_datum_t request : {TIOCSTI, TIOCLINUX})
        filter.refuse(SCMP_SYS(ioctl), EPERM, {hasBits(1, 0xffffffffU, request)});
    if (processesAreRefused)
        refuseProcesses(filter);
    return filter.load();
}

} // namespace favrin::platform
