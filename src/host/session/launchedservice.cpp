#include "host/session/launchedservice.h"

#include <algorithm>
#include <array>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <string_view>
#include <system_error>
#include <vector>

#include <dlfcn.h>
#include <fcntl.h>
#include <spawn.h>
#include <sys/socket.h>
#include <unistd.h>

extern char **environ;

namespace favrin::host {

namespace fs = std::filesystem;

namespace {

constexpr std::string_view programName = "favrin-color-picker-service";
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

/**
 * The folders of the library that this code is part of, and of the program. Without links: the way from here to the
 * service leads over the folder that really holds the file.
 */
std::vector<fs::path> ownFolders()
{
    std::vector<fs::path> files = {"/proc/self/exe"};
    Dl_info info;
    // A program is known by what it was called, which need not be a path.
    if (dladdr(reinterpret_cast<const void *>(&servicePath), &info) && info.dli_fname &&
        std::strchr(info.dli_fname, '/'))
        files.insert(files.begin(), info.dli_fname);
    std::vector<fs::path> folders;
    for (const auto &file : files) {
        std::error_code error;
        if (const fs::path real = fs::canonical(file, error); !error)
            folders.push_back(real.parent_path());
    }
    return folders;
}

bool isProgram(const fs::path &file)
{
    std::error_code error;
    return fs::is_regular_file(file, error) && ::access(file.c_str(), X_OK) == 0;
}

/** An error number of 0 is success. */
int spawn(const std::string &program, int socket, pid_t &process)
{
    auto variables = serviceEnvironment();
    std::vector<char *> environment;
    environment.reserve(variables.size() + 1);
    for (auto &variable : variables)
        environment.push_back(variable.data());
    environment.push_back(nullptr);
    std::array<char *, 2> arguments = {const_cast<char *>(program.c_str()), nullptr};

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
        posix_spawn(&process, program.c_str(), &actions, &attributes, arguments.data(), environment.data());
    posix_spawn_file_actions_destroy(&actions);
    posix_spawnattr_destroy(&attributes);
    return error;
}

} // namespace

std::string servicePath()
{
    if (const char *chosen = std::getenv("FAVRIN_COLOR_PICKER_SERVICE"); chosen && *chosen)
        return chosen;
    std::vector<fs::path> candidates;
    for (const auto &folder : ownFolders()) {
        for (const std::string_view way :
             {programName, std::string_view(FAVRIN_SERVICE_FROM_LIB), std::string_view(FAVRIN_SERVICE_FROM_BIN)})
            candidates.push_back((folder / way).lexically_normal());
    }
    const auto found = std::ranges::find_if(candidates, isProgram);
    if (found != candidates.end())
        return *found;
    return candidates.empty() ? std::string(programName) : candidates[1].string();
}

LaunchedService launchService(const std::string &program)
{
    std::array<int, 2> ends = {-1, -1};
    if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0)
        return {.error = "No connection could be made: " + std::generic_category().message(errno)};
    pid_t process = 0;
    const int error = spawn(program, ends[1], process);
    ::close(ends[1]);
    if (error == 0)
        return {.process = process, .socket = ends[0], .error = {}};
    ::close(ends[0]);
    return {.error = program + ": " + std::generic_category().message(error)};
}

} // namespace favrin::host
