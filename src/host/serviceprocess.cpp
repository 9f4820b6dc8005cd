#include "host/serviceprocess.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QSocketNotifier>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <string>
#include <string_view>
#include <vector>

#include <dlfcn.h>
#include <fcntl.h>
#include <spawn.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

extern char **environ;

namespace favrin::host {

namespace {

constexpr int serviceSocket = 3;

/** What the service inherits of the environment: where the user's data and the session bus are, language and looks. */
constexpr std::array<std::string_view, 32> inheritedVariables = {
    "HOME",
    "USER",
    "LOGNAME",
    "PATH",
    "TMPDIR",
    "TZ",
    "LANG",
    "LANGUAGE",
    "XDG_DATA_HOME",
    "XDG_DATA_DIRS",
    "XDG_CONFIG_HOME",
    "XDG_CONFIG_DIRS",
    "XDG_CACHE_HOME",
    "XDG_RUNTIME_DIR",
    "DBUS_SESSION_BUS_ADDRESS",
    "AT_SPI_BUS_ADDRESS",
    "QT_ACCESSIBILITY",
    "QT_LINUX_ACCESSIBILITY_ALWAYS_ON",
    "FONTCONFIG_FILE",
    "FONTCONFIG_PATH",
    "QT_PLUGIN_PATH",
    "QT_LOGGING_RULES",
    "QT_FATAL_WARNINGS",
    "LD_LIBRARY_PATH",
    "WAYLAND_DEBUG",
    "XKB_CONFIG_ROOT",
    "XCURSOR_PATH",
    "XCURSOR_THEME",
    "ASAN_OPTIONS",
    "LSAN_OPTIONS",
    "UBSAN_OPTIONS",
    "TSAN_OPTIONS",
};

bool isInherited(std::string_view variable)
{
    const auto name = variable.substr(0, variable.find('='));
    if (name.starts_with("LC_") || name.starts_with("FAVRIN_"))
        return true;
    return std::find(inheritedVariables.begin(), inheritedVariables.end(), name) != inheritedVariables.end();
}

std::vector<std::string> serviceEnvironment()
{
    std::vector<std::string> variables;
    for (char **variable = environ; variable && *variable; ++variable) {
        if (isInherited(*variable))
            variables.emplace_back(*variable);
    }
    variables.push_back("WAYLAND_SOCKET=" + std::to_string(serviceSocket));
    return variables;
}

QString folderOfThisLibrary()
{
    Dl_info info;
    if (!dladdr(reinterpret_cast<const void *>(&folderOfThisLibrary), &info) || !info.dli_fname)
        return {};
    // Without links: the way from here to the service leads over the folder that really holds the library.
    return QFileInfo(QFileInfo(QFile::decodeName(info.dli_fname)).absolutePath()).canonicalFilePath();
}

QString describe(const siginfo_t &info)
{
    if (info.si_code == CLD_EXITED)
        return QStringLiteral("exit status %1").arg(info.si_status);
    return QStringLiteral("signal %1").arg(info.si_status);
}

} // namespace

ServiceProcess::ServiceProcess(QObject *parent) : QObject(parent) {}

ServiceProcess::~ServiceProcess()
{
    m_notifier.reset();
    if (m_pidDescriptor >= 0)
        close(m_pidDescriptor);
}

QString ServiceProcess::program()
{
    const auto chosen = qEnvironmentVariable("FAVRIN_COLOR_PICKER_SERVICE");
    if (!chosen.isEmpty())
        return chosen;
    const auto name = QStringLiteral("favrin-color-picker-service");
    QStringList folders = {folderOfThisLibrary()};
    if (QCoreApplication::instance())
        folders.append(QCoreApplication::applicationDirPath());
    for (const auto &folder : folders) {
        const QFileInfo file(folder + u'/' + name);
        if (!folder.isEmpty() && file.isExecutable())
            return file.absoluteFilePath();
    }
    // The installed place, found from the library so that a moved tree works.
    return QFileInfo(folderOfThisLibrary() + QStringLiteral("/" FAVRIN_SERVICE_FROM_LIBRARY)).absoluteFilePath();
}

QString ServiceProcess::start(int socket)
{
    const QByteArray path = QFile::encodeName(program());
    auto variables = serviceEnvironment();
    std::vector<char *> environment;
    environment.reserve(variables.size() + 1);
    for (auto &variable : variables)
        environment.push_back(variable.data());
    environment.push_back(nullptr);
    std::array<char *, 2> arguments = {const_cast<char *>(path.constData()), nullptr};

    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    // First, since an app that has closed its standard input has the socket there. Onto itself it only loses its
    // close-on-exec flag.
    posix_spawn_file_actions_adddup2(&actions, socket, serviceSocket);
    posix_spawn_file_actions_addopen(&actions, 0, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_addclosefrom_np(&actions, serviceSocket + 1);

    posix_spawnattr_t attributes;
    posix_spawnattr_init(&attributes);
    sigset_t none;
    sigemptyset(&none);
    sigset_t all;
    sigfillset(&all);
    posix_spawnattr_setsigmask(&attributes, &none);
    posix_spawnattr_setsigdefault(&attributes, &all);
    posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);

    const int error =
        posix_spawn(&m_pid, path.constData(), &actions, &attributes, arguments.data(), environment.data());
    posix_spawn_file_actions_destroy(&actions);
    posix_spawnattr_destroy(&attributes);
    close(socket);
    if (error != 0) {
        m_pid = 0;
        return QStringLiteral("%1: %2").arg(QFile::decodeName(path), QString::fromLocal8Bit(std::strerror(error)));
    }
    m_pidDescriptor = static_cast<int>(syscall(SYS_pidfd_open, m_pid, 0));
    if (QCoreApplication::instance())
        watch();
    return {};
}

void ServiceProcess::watch()
{
    if (m_pidDescriptor >= 0 && !m_notifier) {
        m_notifier = std::make_unique<QSocketNotifier>(m_pidDescriptor, QSocketNotifier::Read);
        connect(m_notifier.get(), &QSocketNotifier::activated, this, &ServiceProcess::reap);
    }
}

void ServiceProcess::kill()
{
    if (m_pid > 0)
        ::kill(m_pid, SIGKILL);
}

void ServiceProcess::reap()
{
    siginfo_t info = {};
    // An app that reaps all children itself leaves nothing to wait for; the process has ended all the same.
    const bool known = waitid(P_PID, static_cast<id_t>(m_pid), &info, WEXITED | WNOHANG) == 0 && info.si_pid == m_pid;
    m_pid = 0;
    m_notifier->setEnabled(false);
    Q_EMIT ended(known ? describe(info) : QStringLiteral("ended"));
}

} // namespace favrin::host
