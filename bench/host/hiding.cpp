// Counts the frames that the picker draws while its host does not show it, although what it would show changes all the
// time: the host sends colors and appearances, and a caret blinks. One JSON object is printed. Needs an X display.
//
// usage: favrin-bench-hiding

#include "host/benchhost.h"

#include <QJsonDocument>
#include <QTemporaryFile>

#include <array>
#include <cstdlib>

#include <unistd.h>
#include <xcb/xcb.h>

using namespace favrin::bench;

namespace {

constexpr int changes = 100;
constexpr int changeMilliseconds = 10;
constexpr int sliders = 2;

/** Maps or unmaps a window from outside, as a window manager does that minimises it. */
void setMapped(QWindow &window, bool mapped)
{
    auto *connection = xcb_connect(nullptr, nullptr);
    const auto id = static_cast<xcb_window_t>(window.winId());
    const auto request = mapped ? xcb_map_window_checked(connection, id) : xcb_unmap_window_checked(connection, id);
    std::free(xcb_request_check(connection, request));
    xcb_disconnect(connection);
}

struct Way
{
    const char *name;
    void (*setShown)(BenchHost &host, bool shown);
};

constexpr std::array<Way, 4> ways = {{
    {"shown", [](BenchHost &, bool) {}},
    {"window minimised", [](BenchHost &host, bool shown) { setMapped(host.window(), shown); }},
    {"window hidden by the app", [](BenchHost &host, bool shown) { host.window().setVisible(shown); }},
    {"item hidden by the app", [](BenchHost &host, bool shown) { host.picker().view()->setVisible(shown); }},
}};

/** What the picker's process says about its connection, which lists every frame; it writes to the error output. */
class FrameRecord
{
public:
    FrameRecord()
    {
        if (m_file.open())
            dup2(m_file.handle(), STDERR_FILENO);
        qputenv("WAYLAND_DEBUG", "client");
    }

    int frames()
    {
        m_file.seek(0);
        int count = 0;
        for (const auto &line : m_file.readAll().split('\n'))
            count += line.contains(" -> wl_surface@") && line.endsWith(".commit()");
        return count;
    }

private:
    QTemporaryFile m_file;
};

/** Changes what the picker would show; the last change is the same every time. */
void change(FVColorPickerViewController &picker)
{
    using Appearance = FVColorPickerViewController::Appearance;
    for (int i = 1; i <= changes; ++i) {
        picker.setSelectedColor(FVColor(double(i) / changes, 0.5, 0.2));
        picker.setAppearance(i / 10 % 2 ? Appearance::Dark : Appearance::Light);
        BenchHost::rest(changeMilliseconds);
    }
}

bool measure(const Way &way, BenchHost &host, FrameRecord &record, QJsonObject &report)
{
    if (!host.focusTextField())
        return false;
    way.setShown(host, false);
    BenchHost::rest(500);
    const int before = record.frames();
    const int hostBefore = host.frames();
    change(host.picker());
    // A caret blinks twice in a second.
    BenchHost::rest(1500);
    const int drawn = record.frames() - before;
    const int hostDrawn = host.frames() - hostBefore;
    QElapsedTimer clock;
    clock.start();
    way.setShown(host, true);
    host.picker().setSelectedColor(FVColor(0.1, 0.2, 0.3));
    if (!waitFor([&] { return host.frames() > hostBefore + hostDrawn; }))
        return false;
    const double again = milliseconds(clock);
    BenchHost::rest(500);
    report[QLatin1String(way.name)] =
        QJsonObject{{QStringLiteral("picker_frames"), drawn},
                    {QStringLiteral("host_frames"), hostDrawn},
                    {QStringLiteral("shown_again_ms"), again},
                    {QStringLiteral("picker_frames_when_shown_again"), record.frames() - before - drawn}};
    return true;
}

} // namespace

int main(int argc, char *argv[])
{
    qputenv("QT_QPA_PLATFORM", "xcb");
    const Surroundings surroundings;
    FrameRecord record;
    QGuiApplication application(argc, argv);
    BenchHost host;
    Samples unused{"", ""};
    if (!host.present(unused, false))
        return 1;
    host.choose(sliders);
    QJsonObject report;
    for (const auto &way : ways) {
        if (!measure(way, host, record, report))
            return 1;
    }
    std::printf("%s\n", QJsonDocument(report).toJson(QJsonDocument::Compact).constData());
    return 0;
}
