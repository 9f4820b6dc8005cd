#include "platform/confinement/confinement.h"
#include "platform/confinement/inheritance.h"

#include "../../shared/table.h"

#include <QTemporaryDir>
#include <QtTest>

#include <array>
#include <cerrno>
#include <csignal>
#include <functional>
#include <thread>

#include <fcntl.h>
#include <linux/netlink.h>
#include <linux/perf_event.h>
#include <pty.h>
#include <sched.h>
#include <seccomp.h>
#include <spawn.h>
#include <sys/mman.h>
#include <sys/mount.h>
#include <sys/ptrace.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <sys/uio.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

using namespace favrin::platform;
namespace fs = std::filesystem;

namespace {

/** Says with which error number, 0 for none, something ended. */
using Act = std::function<int()>;

constexpr int noAnswer = 255;

/** What @p act says in a process of its own. */
int inChild(const Act &act)
{
    const pid_t child = ::fork();
    if (child == 0)
        ::_exit(act());
    int status = -1;
    return ::waitpid(child, &status, 0) == child && WIFEXITED(status) ? WEXITSTATUS(status) : noAnswer;
}

template<class Result>
int errorOf(Result result)
{
    return result < 0 ? errno : 0;
}

int writing(const fs::path &path, int flags = 0)
{
    const int file = ::open(path.c_str(), O_WRONLY | O_CLOEXEC | flags, 0600);
    return file < 0 ? errno : ::write(file, "x", 1) == 1 ? 0 : errno;
}

int binding(const fs::path &path)
{
    sockaddr_un address = {};
    address.sun_family = AF_UNIX;
    path.string().copy(address.sun_path, sizeof address.sun_path - 1);
    return errorOf(
        ::bind(::socket(AF_UNIX, SOCK_STREAM, 0), reinterpret_cast<const sockaddr *>(&address), sizeof address));
}

/** Of what the kernel shows of the parent to those who may look into it. */
int readingOfParent(const char *what)
{
    return errorOf(::open(("/proc/" + std::to_string(::getppid()) + '/' + what).c_str(), O_RDONLY | O_CLOEXEC));
}

int runningAThread()
{
    int answer = noAnswer;
    std::thread([&answer] { answer = 0; }).join();
    return answer;
}

/** As a driver's compiler does: written, then run. */
int runningMadeCode()
{
    void *page = ::mmap(nullptr, 4096, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    return page == MAP_FAILED ? errno : errorOf(::mprotect(page, 4096, PROT_READ | PROT_EXEC));
}

int sharingMemory()
{
    const int memory = ::memfd_create("test", MFD_CLOEXEC | MFD_ALLOW_SEALING);
    return memory < 0 ? errno : errorOf(::ftruncate(memory, 4096));
}

int spawning()
{
    std::array<char *, 2> arguments = {const_cast<char *>("true"), nullptr};
    pid_t child = 0;
    return ::posix_spawn(&child, "/bin/true", nullptr, nullptr, arguments.data(), nullptr);
}

/** A kernel that was built or started without rules for files. */
void forgetFileRules()
{
    scmp_filter_ctx filter = seccomp_init(SCMP_ACT_ALLOW);
    for (const int call : {SYS_landlock_create_ruleset, SYS_landlock_add_rule, SYS_landlock_restrict_self})
        seccomp_rule_add(filter, SCMP_ACT_ERRNO(ENOSYS), call, 0);
    seccomp_load(filter);
    seccomp_release(filter);
}

} // namespace

class ConfinementTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { QCOMPARE(::openpty(&m_master, &m_terminal, nullptr, nullptr, nullptr), 0); }

    void init()
    {
        m_folder = std::make_unique<QTemporaryDir>();
        const fs::path root = m_folder->path().toStdString();
        m_inside = root / "inside";
        m_outside = root / "outside";
        for (const auto &folder : {m_inside, m_outside}) {
            fs::create_directory(folder);
            QCOMPARE(writing(folder / "file", O_CREAT), 0);
            fs::create_directory(folder / "folder");
        }
    }

    void onlyTheSettingsCanBeWritten_data()
    {
        addRows<int, Act>({
            {"write there", 0, [this] { return writing(m_inside / "file"); }},
            {"make a file there", 0, [this] { return writing(m_inside / "new", O_CREAT | O_EXCL); }},
            {"rename a file there", 0,
             [this] { return errorOf(::rename((m_inside / "file").c_str(), (m_inside / "aside").c_str())); }},
            {"rename a folder there", 0,
             [this] { return errorOf(::rename((m_inside / "folder").c_str(), (m_inside / "aside").c_str())); }},
            {"remove a file there", 0, [this] { return errorOf(::unlink((m_inside / "file").c_str())); }},
            {"make a link there", EACCES, [this] { return errorOf(::symlink("/etc", (m_inside / "link").c_str())); }},
            {"read elsewhere", 0, [this] { return errorOf(::open((m_outside / "file").c_str(), O_RDONLY)); }},
            {"write elsewhere", EACCES, [this] { return writing(m_outside / "file"); }},
            {"empty a file elsewhere", EACCES,
             [this] { return errorOf(::open((m_outside / "file").c_str(), O_RDONLY | O_TRUNC)); }},
            {"make a file elsewhere", EACCES, [this] { return writing(m_outside / "new", O_CREAT); }},
            {"remove a file elsewhere", EACCES, [this] { return errorOf(::unlink((m_outside / "file").c_str())); }},
            {"make a folder elsewhere", EACCES, [this] { return errorOf(::mkdir((m_outside / "n").c_str(), 0700)); }},
            {"fetch a file from elsewhere", EACCES,
             [this] { return errorOf(::rename((m_outside / "file").c_str(), (m_inside / "file").c_str())); }},
            {"link to a file elsewhere", EXDEV,
             [this] { return errorOf(::link((m_outside / "file").c_str(), (m_inside / "link").c_str())); }},
            {"make a socket elsewhere", EACCES, [this] { return binding(m_outside / "socket"); }},
            {"make a pipe elsewhere", EACCES, [this] { return errorOf(::mkfifo((m_outside / "p").c_str(), 0600)); }},
            {"read the parent's memory", EACCES, [] { return readingOfParent("mem"); }},
            {"read the parent's environment", EACCES, [] { return readingOfParent("environ"); }},
            {"enter the parent's root", EACCES, [] { return readingOfParent("root/etc"); }},
            {"write to a device that was named", 0, [] { return writing("/dev/null"); }},
            {"write to another device", EACCES, [] { return writing("/dev/zero"); }},
        });
    }
    void onlyTheSettingsCanBeWritten()
    {
        if (inChild([this] { return confined().filesAreConfined ? 0 : 1; }) != 0)
            QSKIP("this kernel has no rules for files");
        check();
    }

    void noNetworkNoOthers_data()
    {
        addRows<int, Act>({
            {"TCP", EAFNOSUPPORT, [] { return errorOf(::socket(AF_INET, SOCK_STREAM, 0)); }},
            {"UDP by IPv6", EAFNOSUPPORT, [] { return errorOf(::socket(AF_INET6, SOCK_DGRAM, 0)); }},
            {"netlink", EAFNOSUPPORT, [] { return errorOf(::socket(AF_NETLINK, SOCK_RAW, NETLINK_ROUTE)); }},
            {"a local socket", 0, [] { return errorOf(::socket(AF_UNIX, SOCK_STREAM, 0)); }},
            {"io_uring", EPERM, [] { return errorOf(::syscall(SYS_io_uring_setup, 1, nullptr)); }},
            {"user faults", EPERM, [] { return errorOf(::syscall(SYS_userfaultfd, 0)); }},
            {"key rings", EPERM, [] { return errorOf(::syscall(SYS_keyctl, 0, -3, 0)); }},
            {"mounting", EPERM, [this] { return errorOf(::mount("none", m_inside.c_str(), "tmpfs", 0, nullptr)); }},
            {"another root", EPERM, [this] { return errorOf(::chroot(m_inside.c_str())); }},
            {"programs for the kernel", EPERM, [] { return errorOf(::syscall(SYS_bpf, 0, nullptr, 0)); }},
            {"the clock", EPERM,
             [] {
                 timespec now = {};
                 ::clock_gettime(CLOCK_REALTIME, &now);
                 return errorOf(::clock_settime(CLOCK_REALTIME, &now));
             }},
            {"a file by its number", EPERM, [] { return errorOf(::syscall(SYS_open_by_handle_at, 0, nullptr, 0)); }},
            {"a server", EPERM, [] { return errorOf(::listen(::socket(AF_UNIX, SOCK_STREAM, 0), 1)); }},
            {"modes of files", EPERM, [this] { return errorOf(::chmod((m_outside / "file").c_str(), 0666)); }},
            {"times of files", EPERM,
             [this] { return errorOf(::utimensat(AT_FDCWD, (m_outside / "file").c_str(), nullptr, 0)); }},
            {"keys into a terminal", EPERM, [this] { return errorOf(::ioctl(m_terminal, TIOCSTI, "x")); }},
            {"a thread", 0, runningAThread},
            {"code that was made", 0, runningMadeCode},
            {"shared memory", 0, sharingMemory},
            {"a signal to itself", 0, [] { return std::signal(SIGUSR1, SIG_IGN), errorOf(::raise(SIGUSR1)); }},
        });
    }
    void noNetworkNoOthers() { check(); }
    void noProcesses_data()
    {
        addRows<int, Act>({
            {"a child", EPERM, [] { return errorOf(::fork()); }},
            {"a child by the kernel's name", EPERM,
             [] { return errorOf(::syscall(SYS_clone, SIGCHLD, nullptr, nullptr, nullptr, nullptr)); }},
            {"another program", EPERM, spawning},
            {"itself as another program", EPERM, [] { return errorOf(::execl("/bin/true", "true", nullptr)); }},
            {"a signal to the parent", EPERM, [] { return errorOf(::kill(::getppid(), SIGCONT)); }},
            {"a look into the parent", EPERM,
             [] { return errorOf(::ptrace(PTRACE_SEIZE, ::getppid(), nullptr, nullptr)); }},
            {"counting another's steps", EPERM,
             [] {
                 perf_event_attr attributes = {};
                 attributes.size = sizeof attributes;
                 return errorOf(::syscall(SYS_perf_event_open, &attributes, ::getppid(), -1, -1, 0));
             }},
            {"a name space of its own", EPERM, [] { return errorOf(::unshare(CLONE_NEWUSER)); }},
            {"the parent's memory by a call", EPERM,
             [] {
                 char byte = 0;
                 iovec here = {&byte, 1};
                 iovec there = {&byte, 1};
                 return errorOf(::process_vm_readv(::getppid(), &here, 1, &there, 1, 0));
             }},
            {"the parent's descriptors", EPERM,
             [] {
                 const auto parent = ::syscall(SYS_pidfd_open, ::getppid(), 0);
                 return errorOf(::syscall(SYS_pidfd_getfd, parent, 0, 0));
             }},
        });
    }
    void noProcesses()
    {
#ifdef FAVRIN_SANITIZED
        QSKIP("sanitizers start processes");
#endif
        check();
    }

    void anOlderKernelIsNoError()
    {
        const int answer = inChild([this] {
            forgetFileRules();
            const auto result = confined();
            const bool said = result.missing.find("file rules") != std::string::npos;
            const bool goesOn = writing(m_outside / "file") == 0;
            return !result.filesAreConfined && result.systemCallsAreFiltered && said && goesOn ? 0 : 1;
        });
        QCOMPARE(answer, 0);
    }

    void onlyOneDescriptorIsKept()
    {
        const int answer = inChild([] {
            const int kept = ::fcntl(1, F_DUPFD, 100);
            ::fcntl(1, F_DUPFD, 50);
            ::fcntl(1, F_DUPFD, 900);
            // A parent without standard streams: the first file would become the output.
            ::close(0);
            ::close(2);
            keepOnlyDescriptor(kept);
            for (int number = 0; number < 1024; ++number) {
                if ((::fcntl(number, F_GETFD) >= 0) != (number <= 2 || number == kept))
                    return number % 200 + 1;
            }
            char byte = 0;
            return ::write(2, "x", 1) == 1 && ::read(0, &byte, 1) == 0 ? 0 : 254;
        });
        QCOMPARE(answer, 0);
    }

    void nothingOutlivesTheParentOrACrash()
    {
        // As far as it may: the limit before must not be what keeps the dump away.
        rlimit before = {};
        QCOMPARE(::getrlimit(RLIMIT_CORE, &before), 0);
        before.rlim_cur = before.rlim_max;
        QCOMPARE(::setrlimit(RLIMIT_CORE, &before), 0);
        const int answer = inChild([] {
            leaveNoCoreDump();
            rlimit limit = {};
            return ::getrlimit(RLIMIT_CORE, &limit) == 0 && limit.rlim_max == 1 ? 0 : 1;
        });
        QCOMPARE(answer, 0);
        const pid_t crashing = ::fork();
        if (crashing == 0) {
            ::chdir(m_inside.c_str());
            leaveNoCoreDump();
            std::signal(SIGSEGV, SIG_DFL);
            ::raise(SIGSEGV);
        }
        int status = 0;
        QCOMPARE(::waitpid(crashing, &status, 0), crashing);
        QVERIFY(WIFSIGNALED(status) && !WCOREDUMP(status));

        std::array<int, 2> pipe = {-1, -1};
        QCOMPARE(::pipe(pipe.data()), 0);
        inChild([&] {
            if (::fork() == 0) {
                endWithParent();
                static_cast<void>(::write(pipe[1], "x", 1));
                for (;;)
                    ::pause();
            }
            // Only once the child has bound itself.
            char byte = 0;
            return ::read(pipe[0], &byte, 1) == 1 ? 0 : 1;
        });
        ::close(pipe[1]);
        // The end of the pipe: nobody is left who could write to it.
        char byte = 0;
        QCOMPARE(::read(pipe[0], &byte, 1), ssize_t(0));
        ::close(pipe[0]);
    }

private:
    void check()
    {
        const auto row = ::row<int, Act>();
        QCOMPARE(inChild([&] { return confined(), std::get<Act>(row)(); }), std::get<int>(row));
    }

    ConfinementResult confined() const
    {
        return confine({.writableFolders = {m_inside, m_inside / "missing"}, .writableDevices = {"/dev/null"}});
    }

    std::unique_ptr<QTemporaryDir> m_folder;
    fs::path m_inside;
    fs::path m_outside;
    int m_master = -1;
    int m_terminal = -1;
};

QTEST_GUILESS_MAIN(ConfinementTest)
#include "tst_confinement.moc"
