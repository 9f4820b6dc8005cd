// Starts a program and says when its window is first painted, as seen on the X display: the first damage after which a
// top-level window holds eight colors. Then lets it rest and reads what its processes hold. One JSON object is printed.
// With --idle it goes on: what an opening sets going has time to end, and what happens from then on is counted.
//
// usage: watch-window [--idle SECONDS] PROGRAM [ARGUMENT...]

#include <X11/Xlib.h>
#include <X11/Xutil.h>
#include <X11/extensions/Xdamage.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <map>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include <poll.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

extern char **environ;

namespace {

using Clock = std::chrono::steady_clock;
using namespace std::chrono_literals;

constexpr auto patience = 20s;
constexpr auto restTime = 600ms;
/** An opening asks the picker once more some seconds later, and threads that Qt kept ready end after thirty. */
constexpr auto settleTime = 35s;
constexpr std::size_t colorsOfAPicture = 8;
constexpr int smallestDialog = 100;

int damageEvent = 0;

/** Windows come and go while they are asked about. */
int ignoreError(Display *, XErrorEvent *)
{
    return 0;
}

bool isPainted(Display *display, Window window)
{
    XWindowAttributes attributes;
    if (!XGetWindowAttributes(display, window, &attributes) || attributes.map_state != IsViewable ||
        attributes.width < smallestDialog || attributes.height < smallestDialog)
        return false;
    const int width = std::min(attributes.width, WidthOfScreen(attributes.screen) - attributes.x);
    const int height = std::min(attributes.height, HeightOfScreen(attributes.screen) - attributes.y);
    XImage *image = XGetImage(display, window, 0, 0, static_cast<unsigned>(width), static_cast<unsigned>(height),
                              AllPlanes, ZPixmap);
    if (!image)
        return false;
    std::set<unsigned long> colors;
    for (int y = 0; y < height && colors.size() < colorsOfAPicture; y += 3) {
        for (int x = 0; x < width; x += 3)
            colors.insert(XGetPixel(image, x, y));
    }
    XDestroyImage(image);
    return colors.size() >= colorsOfAPicture;
}

bool waitForPicture(Display *display)
{
    const auto end = Clock::now() + patience;
    pollfd connection = {ConnectionNumber(display), POLLIN, 0};
    while (Clock::now() < end) {
        if (!XPending(display)) {
            poll(&connection, 1, 100);
            continue;
        }
        XEvent event;
        XNextEvent(display, &event);
        if (event.type == CreateNotify) {
            XDamageCreate(display, event.xcreatewindow.window, XDamageReportNonEmpty);
        } else if (event.type == damageEvent) {
            const auto &damage = reinterpret_cast<const XDamageNotifyEvent &>(event);
            XDamageSubtract(display, damage.damage, None, None);
            if (isPainted(display, damage.drawable))
                return true;
        }
    }
    return false;
}

std::string contents(const std::string &file)
{
    std::ostringstream text;
    text << std::ifstream(file).rdbuf();
    return text.str();
}

void addFamily(pid_t process, std::vector<pid_t> &family)
{
    family.push_back(process);
    const std::string folder = "/proc/" + std::to_string(process) + "/task";
    std::error_code error;
    for (const auto &thread : std::filesystem::directory_iterator(folder, error)) {
        std::istringstream children(contents(thread.path().string() + "/children"));
        for (pid_t child = 0; children >> child;)
            addFamily(child, family);
    }
}

double field(const std::string &text, const std::string &name)
{
    const auto found = text.find(name);
    return found == std::string::npos ? 0.0 : std::strtod(text.c_str() + found + name.size(), nullptr);
}

struct Footprint
{
    double peak = 0, proportional = 0, privately = 0;
    long faults = 0, diskFaults = 0;
    std::size_t libraries = 0;
    long threads = 0;
    double processorTime = 0;
};

Footprint footprint(pid_t process)
{
    const std::string folder = "/proc/" + std::to_string(process);
    const std::string status = contents(folder + "/status");
    const std::string rollup = contents(folder + "/smaps_rollup");
    Footprint result;
    result.peak = field(status, "VmHWM:") / 1024;
    result.threads = static_cast<long>(field(status, "Threads:"));
    result.proportional = field(rollup, "\nPss:") / 1024;
    result.privately = (field(rollup, "Private_Clean:") + field(rollup, "Private_Dirty:")) / 1024;
    const std::string stat = contents(folder + "/stat");
    std::istringstream fields(stat.substr(std::min(stat.rfind(')') + 2, stat.size())));
    std::vector<std::string> values;
    for (std::string value; fields >> value;)
        values.push_back(value);
    if (values.size() > 12) {
        result.faults = std::atol(values[7].c_str());
        result.diskFaults = std::atol(values[9].c_str());
        result.processorTime = (std::atof(values[11].c_str()) + std::atof(values[12].c_str())) * 1000.0 /
                               static_cast<double>(sysconf(_SC_CLK_TCK));
    }
    std::set<std::string> libraries;
    std::istringstream maps(contents(folder + "/maps"));
    for (std::string line; std::getline(maps, line);) {
        const auto path = line.find('/');
        if (path != std::string::npos && line.find(".so", path) != std::string::npos)
            libraries.insert(line.substr(path));
    }
    result.libraries = libraries.size();
    return result;
}

/** When a window was first painted: since the start of its program, and on the clock of the day in seconds. */
struct Painted
{
    double milliseconds = 0;
    double at = 0;
};

using Sleeps = std::map<std::string, long>;

/** How often each thread of a process has gone to sleep. */
Sleeps sleeps(pid_t process)
{
    Sleeps counts;
    std::error_code error;
    for (const auto &thread : std::filesystem::directory_iterator("/proc/" + std::to_string(process) + "/task", error))
        counts[thread.path().string()] =
            static_cast<long>(field(contents(thread.path().string() + "/status"), "\nvoluntary_ctxt_switches:"));
    return counts;
}

/** A thread that ended in between, or began, was awake for it once. */
long wakeUpsBetween(const Sleeps &before, const Sleeps &after)
{
    long count = 0;
    for (const auto &[thread, number] : after)
        count += before.contains(thread) ? number - before.at(thread) : number + 1;
    for (const auto &[thread, number] : before)
        count += after.contains(thread) ? 0 : 1;
    return count;
}

std::string name(pid_t process)
{
    std::error_code error;
    return std::filesystem::read_symlink("/proc/" + std::to_string(process) + "/exe", error).filename().string();
}

/** The frames that a display shows for a while. Each is acknowledged, since a display reports no second one before. */
long changesWhile(Display *display, std::chrono::milliseconds duration)
{
    long changes = 0;
    const auto end = Clock::now() + duration;
    while (Clock::now() < end) {
        usleep(50'000);
        while (XPending(display)) {
            XEvent event;
            XNextEvent(display, &event);
            if (event.type != damageEvent)
                continue;
            ++changes;
            XDamageSubtract(display, reinterpret_cast<const XDamageNotifyEvent &>(event).damage, None, None);
        }
    }
    return changes;
}

void reportIdleness(Display *display, const std::vector<pid_t> &family, int seconds)
{
    changesWhile(display, settleTime);
    std::vector<Sleeps> before;
    for (const pid_t member : family)
        before.push_back(sleeps(member));
    const long changes = changesWhile(display, std::chrono::seconds(seconds));
    std::printf(", \"idle_seconds\": %d, \"idle_frames\": %ld, \"idle_wake_ups\": {", seconds, changes);
    for (std::size_t i = 0; i < family.size(); ++i)
        std::printf("%s\"%s\": %ld", i ? ", " : "", name(family[i]).c_str(),
                    wakeUpsBetween(before[i], sleeps(family[i])));
    std::printf("}");
}

void report(Display *display, pid_t process, Painted painted, int idleSeconds)
{
    std::vector<pid_t> family;
    addFamily(process, family);
    std::printf("{\"painted\": %.3f, \"painted_at\": %.6f, \"processes\": [", painted.milliseconds, painted.at);
    const char *separator = "";
    for (const pid_t member : family) {
        const Footprint print = footprint(member);
        std::printf("%s{\"name\": \"%s\", \"peak\": %.2f, \"pss\": %.2f, \"private\": %.2f, \"faults\": %ld, "
                    "\"disk_faults\": %ld, \"libraries\": %zu, \"threads\": %ld, \"processor_ms\": %.0f}",
                    separator, name(member).c_str(), print.peak, print.proportional, print.privately, print.faults,
                    print.diskFaults, print.libraries, print.threads, print.processorTime);
        separator = ", ";
    }
    std::printf("]");
    if (idleSeconds > 0)
        reportIdleness(display, family, idleSeconds);
    std::printf("}\n");
}

} // namespace

int main(int argc, char *argv[])
{
    int first = 1;
    int idleSeconds = 0;
    if (argc > 2 && !std::strcmp(argv[1], "--idle")) {
        idleSeconds = std::atoi(argv[2]);
        first = 3;
    }
    Display *display = XOpenDisplay(nullptr);
    int errorBase = 0;
    if (!display || argc <= first || !XDamageQueryExtension(display, &damageEvent, &errorBase))
        return 2;
    damageEvent += XDamageNotify;
    XSetErrorHandler(ignoreError);
    XSelectInput(display, DefaultRootWindow(display), SubstructureNotifyMask);
    XSync(display, False);

    posix_spawnattr_t attributes;
    posix_spawnattr_init(&attributes);
    posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETPGROUP);
    posix_spawnattr_setpgroup(&attributes, 0);
    pid_t process = 0;
    const auto start = Clock::now();
    if (posix_spawnp(&process, argv[first], nullptr, &attributes, argv + first, environ) != 0)
        return 2;
    const bool isPainted = waitForPicture(display);
    const Painted painted = {
        std::chrono::duration<double, std::milli>(Clock::now() - start).count(),
        std::chrono::duration<double>(std::chrono::system_clock::now().time_since_epoch()).count()};
    if (isPainted) {
        changesWhile(display, restTime);
        report(display, process, painted, idleSeconds);
    }
    kill(-process, SIGTERM);
    for (int i = 0; i < 100 && waitpid(process, nullptr, WNOHANG) == 0; ++i)
        usleep(20'000);
    kill(-process, SIGKILL);
    return isPainted ? 0 : 1;
}
