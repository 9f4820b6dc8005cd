// Times what an app and its user wait for: from present() to the first frame of the picker in the app's window, with a
// process started for it (cold) and with one started ahead, and from an input event at the app to the pick message and
// to the changed frame. Also the memory of the picker's process. Medians with ranges; one JSON object on the last line.
//
// usage: favrin-bench-presenting [rounds]

#include "host/fvcolorpickerviewcontroller.h"

#include <QDir>
#include <QElapsedTimer>
#include <QEventLoop>
#include <QFile>
#include <QGuiApplication>
#include <QJsonDocument>
#include <QJsonObject>
#include <QMouseEvent>
#include <QTemporaryDir>
#include <QTimer>

#include <algorithm>
#include <array>
#include <cstdio>
#include <functional>
#include <vector>

namespace {

using State = FVColorPickerViewController::State;
constexpr int dragSteps = 200;
constexpr int patienceMilliseconds = 10'000;

struct Samples
{
    const char *name;
    const char *unit;
    std::vector<double> values = {};

    double at(double part) const { return values[static_cast<std::size_t>(part * double(values.size() - 1))]; }
    QJsonObject report()
    {
        if (values.empty())
            return {};
        std::sort(values.begin(), values.end());
        std::printf("%-44s %8.2f %s  (%.2f–%.2f, 99th percentile %.2f, n = %zu)\n", name, at(0.5), unit, values.front(),
                    values.back(), at(0.99), values.size());
        return {{QStringLiteral("median"), at(0.5)},
                {QStringLiteral("min"), values.front()},
                {QStringLiteral("max"), values.back()},
                {QStringLiteral("p99"), at(0.99)}};
    }
};

bool waitFor(const std::function<bool()> &condition)
{
    QElapsedTimer clock;
    clock.start();
    QTimer wakeUp;
    wakeUp.start(patienceMilliseconds);
    while (!condition()) {
        if (clock.hasExpired(patienceMilliseconds))
            return false;
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents | QEventLoop::AllEvents);
    }
    return true;
}

double milliseconds(const QElapsedTimer &clock)
{
    return double(clock.nsecsElapsed()) / 1e6;
}

double processMemory(qint64 pid, const QByteArray &field, const char *file)
{
    QFile status(QStringLiteral("/proc/%1/%2").arg(pid).arg(QLatin1String(file)));
    if (!status.open(QIODevice::ReadOnly))
        return 0;
    for (const auto &line : status.readAll().split('\n')) {
        if (line.startsWith(field))
            return line.mid(field.size()).trimmed().split(' ').first().toDouble() / 1024;
    }
    return 0;
}

qint64 servicePid()
{
    QFile children(QStringLiteral("/proc/self/task/%1/children").arg(QCoreApplication::applicationPid()));
    return children.open(QIODevice::ReadOnly) ? children.readAll().trimmed().split(' ').last().toLongLong() : 0;
}

class Bench
{
public:
    Bench()
    {
        m_window.resize(900, 700);
        m_window.show();
        QObject::connect(&m_window, &QQuickWindow::frameSwapped, &m_window, [this] { ++m_frames; });
        QObject::connect(&m_picker, &FVColorPickerViewController::pickerDidSelectColor, &m_window,
                         [this] { ++m_picks; });
        // The picker has drawn; the next frame of the window shows it.
        QObject::connect(&m_picker, &FVColorPickerViewController::stateChanged, &m_window,
                         [this] { m_framesAtReady = m_frames; });
        m_picker.setReduceMotion(true);
    }

    bool present(Samples &samples, bool ahead)
    {
        if (ahead) {
            FVColorPickerViewController::startServiceAhead();
            rest(400);
        }
        QElapsedTimer clock;
        clock.start();
        m_picker.present(&m_window);
        if (!waitFor([this] { return m_picker.state() != State::Starting; }) || m_picker.state() != State::Ready)
            return false;
        if (!waitFor([this] { return m_frames > m_framesAtReady; }))
            return false;
        samples.values.push_back(milliseconds(clock));
        return true;
    }

    bool finish()
    {
        m_picker.dismiss();
        return waitFor([this] { return m_picker.state() == State::NotRunning; });
    }

    /** Shows a tab by its segment. */
    void choose(int tab)
    {
        const auto *view = m_picker.view();
        const auto segment = view->mapToScene(QPointF(padding + (tab + 0.5) / 3 * (view->width() - 2 * padding), 71));
        send(QEvent::MouseButtonPress, segment);
        send(QEvent::MouseButtonRelease, segment);
        rest(300);
    }

    /** @param place of a step's number: fractions of the tab's width and height, never the same twice in a row */
    bool drag(Samples &messages, Samples &frames, const std::function<QPointF(int)> &place)
    {
        const auto *view = m_picker.view();
        const double width = (view->width() - 2 * padding - 18) / 2;
        const QPointF origin = view->mapToScene(QPointF(padding, 103));
        const auto position = [&](int step) {
            return origin + QPointF(place(step).x() * width, place(step).y() * width / 1.2);
        };
        send(QEvent::MouseButtonPress, position(0));
        for (int step = 1; step <= dragSteps; ++step) {
            // Nothing of the step before is on its way any more.
            rest(20);
            const int picks = m_picks;
            const int shown = m_frames;
            QElapsedTimer clock;
            clock.start();
            send(QEvent::MouseMove, position(step));
            if (!waitFor([&] { return m_picks > picks; }))
                return false;
            messages.values.push_back(milliseconds(clock));
            if (!waitFor([&] { return m_frames > shown; }))
                return false;
            frames.values.push_back(milliseconds(clock));
        }
        send(QEvent::MouseButtonRelease, position(dragSteps));
        rest(20);
        return true;
    }

    void memory(Samples &proportional, Samples &peak)
    {
        const auto pid = servicePid();
        proportional.values.push_back(processMemory(pid, "Pss:", "smaps_rollup"));
        peak.values.push_back(processMemory(pid, "VmHWM:", "status"));
    }

private:
    void send(QEvent::Type type, const QPointF &position)
    {
        const auto button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
        const auto held = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(type, position, position, button, held, {});
        QCoreApplication::sendEvent(&m_window, &event);
    }
    static void rest(int duration)
    {
        QEventLoop loop;
        QTimer::singleShot(duration, &loop, &QEventLoop::quit);
        loop.exec();
    }

    /** On either side of what the picker shows. */
    static constexpr double padding = 20;

    QQuickWindow m_window;
    FVColorPickerViewController m_picker;
    int m_frames = 0;
    int m_framesAtReady = 0;
    int m_picks = 0;
};

QPointF swatch(int step)
{
    return {(step % 12 + 0.5) / 12, (step / 12 % 10 + 0.5) / 10};
}

QPointF fieldPlace(int step)
{
    return {0.05 + 0.9 * (step * 7 % 101) / 101, 0.05 + 0.9 * (step * 13 % 97) / 97};
}

/** On the red track, the first row of its tab. */
QPointF trackPlace(int step)
{
    return {0.1 + 0.45 * (step * 7 % 101) / 101, 0.19};
}

/** What a drag in a tab costs. */
struct Drags
{
    int tab;
    QPointF (*place)(int step);
    Samples message;
    Samples frame;
};

} // namespace

int main(int argc, char *argv[])
{
    const QTemporaryDir data;
    qputenv("FAVRIN_DEFAULTS_FILE", QFile::encodeName(data.path() + QStringLiteral("/defaults.sqlite")));
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    QGuiApplication application(argc, argv);
    const int rounds = argc > 1 ? std::max(1, atoi(argv[1])) : 15;

    Samples cold{"present to first frame, cold", "ms"};
    Samples ahead{"present to first frame, started ahead", "ms"};
    std::array<Drags, 3> drags = {{
        {0, swatch, {"grid drag: event to pick message", "ms"}, {"grid drag: event to changed frame", "ms"}},
        {1,
         fieldPlace,
         {"spectrum drag: event to pick message", "ms"},
         {"spectrum drag: event to changed frame", "ms"}},
        {2,
         trackPlace,
         {"red slider drag: event to pick message", "ms"},
         {"red slider drag: event to changed frame", "ms"}},
    }};
    Samples memory{"service: proportional memory", "MB"};
    Samples peak{"service: peak resident memory", "MB"};
    Bench bench;
    for (int round = 0; round < rounds; ++round) {
        // In turns, so that a busy moment of the machine meets both.
        if (!bench.present(cold, false))
            return 1;
        bench.memory(memory, peak);
        if (!bench.finish() || !bench.present(ahead, true) || !bench.finish())
            return 1;
    }
    if (!bench.present(cold, false))
        return 1;
    std::vector<Samples *> all = {&cold, &ahead, &memory, &peak};
    for (auto &[tab, place, message, frame] : drags) {
        bench.choose(tab);
        if (!bench.drag(message, frame, place))
            return 1;
        all.insert(all.end(), {&message, &frame});
    }
    QJsonObject report;
    for (auto *samples : all)
        report[QLatin1String(samples->name)] = samples->report();
    std::printf("%s\n", QJsonDocument(report).toJson(QJsonDocument::Compact).constData());
    return 0;
}
