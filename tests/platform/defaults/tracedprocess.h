#pragma once

#include <fcntl.h>
#include <sys/ptrace.h>
#include <sys/syscall.h>
#include <sys/uio.h>
#include <sys/user.h>
#include <sys/wait.h>
#include <unistd.h>

#include <atomic>
#include <csignal>
#include <functional>

/** What is done to a process, counted in those of its system calls that may fail. */
struct Fault
{
    enum class Kind { None, Kill, FailOnce, FailFromThenOn };

    Kind kind = Kind::None;
    int call = -1;
    int error = 0;
};

/** A child that is stopped at each of its system calls, as long as it asks for that. */
class TracedProcess
{
public:
    /** What parent and child share. */
    struct Shared
    {
        std::atomic<bool> isWatched = false;
        std::atomic<bool> isRefused = false;
    };

    enum class End { Done, Killed, Crashed, Refused };

    /** Only the numbers and registers of this architecture are known here. */
    static constexpr bool isSupported()
    {
#ifdef __x86_64__
        return true;
#else
        return false;
#endif
    }

    /** Runs @p work, with @p fault where it says that it is watched, and counts its calls there. */
    template<class Work>
    End run(Shared &shared, const Fault &fault, Work work)
    {
        m_fault = fault;
        m_calls = 0;
        m_child = ::fork();
        if (m_child == 0) {
            if (::ptrace(PTRACE_TRACEME, 0, nullptr, nullptr) != 0) {
                shared.isRefused = true;
                ::_exit(0);
            }
            ::raise(SIGSTOP);
            work();
            ::_exit(0);
        }
        return follow(shared);
    }

    int calls() const
    {
        return m_calls;
    }

private:
    End follow(const Shared &shared)
    {
        int status = 0;
        ::waitpid(m_child, &status, 0);
        if (WIFEXITED(status))
            return shared.isRefused ? End::Refused : End::Crashed;
        ::ptrace(PTRACE_SETOPTIONS, m_child, nullptr, PTRACE_O_TRACESYSGOOD | PTRACE_O_EXITKILL);
        bool isEntry = true;
        bool isFailing = false;
        int signal = 0;
        for (;;) {
            ::ptrace(PTRACE_SYSCALL, m_child, nullptr, signal);
            ::waitpid(m_child, &status, 0);
            if (WIFEXITED(status))
                return WEXITSTATUS(status) == 0 ? End::Done : End::Crashed;
            if (WIFSIGNALED(status))
                return m_isKilled ? End::Killed : End::Crashed;
            const bool isCall = WSTOPSIG(status) == (SIGTRAP | 0x80);
            signal = isCall ? 0 : WSTOPSIG(status);
            if (!isCall)
                continue;
            if (isEntry)
                isFailing = shared.isWatched && enter();
            else if (isFailing)
                leave();
            isEntry = !isEntry;
        }
    }

#ifdef __x86_64__
    /** At the begin of a call; true when it is to fail at its end. */
    bool enter()
    {
        user_regs_struct registers = {};
        ::ptrace(PTRACE_GETREGS, m_child, nullptr, &registers);
        if (!canFail(registers))
            return false;
        const int number = m_calls++;
        const bool isMeant =
            m_fault.kind == Fault::Kind::FailFromThenOn ? number >= m_fault.call : number == m_fault.call;
        if (!isMeant || m_fault.kind == Fault::Kind::None)
            return false;
        if (m_fault.kind == Fault::Kind::Kill) {
            m_isKilled = true;
            ::kill(m_child, SIGKILL);
            return false;
        }
        // No call has this number, so that nothing happens. A descriptor is gone even where its closing reports an
        // error.
        if (registers.orig_rax != SYS_close) {
            registers.orig_rax = ~0ULL;
            ::ptrace(PTRACE_SETREGS, m_child, nullptr, &registers);
        }
        return true;
    }

    void leave() const
    {
        user_regs_struct registers = {};
        ::ptrace(PTRACE_GETREGS, m_child, nullptr, &registers);
        registers.rax = static_cast<unsigned long long>(-m_fault.error);
        ::ptrace(PTRACE_SETREGS, m_child, nullptr, &registers);
    }

    /** Memory and time are no matter of the disk, and a lock can always be given back. */
    bool canFail(const user_regs_struct &registers) const
    {
        switch (registers.orig_rax) {
        case SYS_fcntl:
            return registers.rsi != F_SETLK ||
                   static_cast<short>(::ptrace(PTRACE_PEEKDATA, m_child, registers.rdx, nullptr)) != F_UNLCK;
        case SYS_mmap:
            return static_cast<int>(registers.r8) >= 0;
        case SYS_brk:
        case SYS_munmap:
        case SYS_mremap:
        case SYS_mprotect:
        case SYS_madvise:
        case SYS_futex:
        case SYS_clock_nanosleep:
        case SYS_restart_syscall:
        case SYS_exit_group:
            return false;
        }
        return true;
    }
#else
    bool enter()
    {
        return false;
    }
    void leave() const {}
#endif

    Fault m_fault;
    pid_t m_child = -1;
    int m_calls = 0;
    bool m_isKilled = false;
};
