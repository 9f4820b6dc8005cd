#pragma once

#include "host/fvcolorpickerviewcontroller.h"

#include <QDir>
#include <QElapsedTimer>
#include <QEventLoop>
#include <QFile>
#include <QGuiApplication>
#include <QJsonObject>
#include <QMouseEvent>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTemporaryDir>
#include <QTimer>

#include <algorithm>
#include <cstdio>
#include <functional>
#include <vector>

namespace favrin::bench {

using State = FVColorPickerViewController::State;
inline constexpr int dragSteps = 200;
inline constexpr int patienceMilliseconds = 10'000;

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

/** What a benchmark needs before there is an application: settings of its own, and drawing by the processor. */
class Surroundings
{
public:
    Surroundings()
    {
        qputenv("FAVRIN_DEFAULTS_FILE", QFile::encodeName(m_data.filePath(QStringLiteral("defaults.sqlite"))));
        if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
            qputenv("QT_QPA_PLATFORM", "offscreen");
        QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    }

private:
    const QTemporaryDir m_data;
};

inline bool waitFor(const std::function<bool()> &condition)
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

inline double milliseconds(const QElapsedTimer &clock)
{
    return double(clock.nsecsElapsed()) / 1e6;
}

inline double processMemory(qint64 pid, const QByteArray &field, const char *file)
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

inline qint64 servicePid()
{
    QFile children(QStringLiteral("/proc/self/task/%1/children").arg(QCoreApplication::applicationPid()));
    return children.open(QIODevice::ReadOnly) ? children.readAll().trimmed().split(' ').last().toLongLong() : 0;
}

/** A host with a window that is shown, and one picker. */
class BenchHost
{
public:
    BenchHost()
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
        // The app has started: what follows is the picker's.
        rest(300);
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
        click(tab);
        rest(300);
    }

    /** From the click on a tab's segment to the frame that shows the tab. */
    bool switchTo(Samples &samples, int tab)
    {
        const int shown = m_frames;
        QElapsedTimer clock;
        clock.start();
        click(tab);
        if (!waitFor([&] { return m_frames > shown; }))
            return false;
        samples.values.push_back(milliseconds(clock));
        rest(200);
        return true;
    }

    /** From the window's other size to the last frame that it causes. */
    bool resize(Samples &samples, QSize size)
    {
        double last = 0;
        QElapsedTimer clock;
        clock.start();
        const auto connection =
            QObject::connect(&m_window, &QQuickWindow::frameSwapped, &m_window, [&] { last = milliseconds(clock); });
        m_window.resize(size);
        rest(500);
        QObject::disconnect(connection);
        if (last > 0)
            samples.values.push_back(last);
        return last > 0;
    }

    FVColorPickerViewController &picker() { return m_picker; }
    QQuickWindow &window() { return m_window; }
    /** How many the window has shown. */
    int frames() const { return m_frames; }

    /** Moves the focus on until a caret blinks. */
    bool focusTextField()
    {
        m_picker.view()->forceActiveFocus();
        for (int i = 0; i < mostElements; ++i) {
            if (m_picker.view()->flags().testFlag(QQuickItem::ItemAcceptsInputMethod))
                return true;
            for (const auto type : {QEvent::KeyPress, QEvent::KeyRelease}) {
                QKeyEvent event(type, Qt::Key_Tab, Qt::NoModifier, tabKeyCode, 0, 0);
                QCoreApplication::sendEvent(&m_window, &event);
            }
            rest(100);
        }
        return false;
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

    void beginDrag() { send(QEvent::MouseButtonPress, placeOnTheWay(0)); }
    /** Steps as fast as they can be sent, until the picker has answered one of them. The way is a line there and back.
     */
    bool dragSome(int steps)
    {
        const int picks = m_picks;
        for (int step = 0; step < steps; ++step)
            send(QEvent::MouseMove, placeOnTheWay(++m_dragStep));
        return waitFor([&] { return m_picks > picks; });
    }
    void endDrag() { send(QEvent::MouseButtonRelease, placeOnTheWay(m_dragStep)); }

    void memory(Samples &proportional, Samples &peak)
    {
        const auto pid = servicePid();
        proportional.values.push_back(processMemory(pid, "Pss:", "smaps_rollup"));
        peak.values.push_back(processMemory(pid, "VmHWM:", "status"));
    }

    static void rest(int duration)
    {
        QEventLoop loop;
        QTimer::singleShot(duration, &loop, &QEventLoop::quit);
        loop.exec();
    }

private:
    QPointF placeOnTheWay(int step) const
    {
        return m_picker.view()->mapToScene(QPointF(padding + 20 + step * 7 % 101, 120 + step * 13 % 97));
    }
    void click(int tab)
    {
        const auto *view = m_picker.view();
        const auto segment = view->mapToScene(QPointF(padding + (tab + 0.5) / 3 * (view->width() - 2 * padding), 71));
        send(QEvent::MouseButtonPress, segment);
        send(QEvent::MouseButtonRelease, segment);
    }
    void send(QEvent::Type type, const QPointF &position)
    {
        const auto button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
        const auto held = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(type, position, position, button, held, {});
        QCoreApplication::sendEvent(&m_window, &event);
    }

    /** On either side of what the picker shows. */
    static constexpr double padding = 20;
    static constexpr int mostElements = 20;
    /** As X counts keys. */
    static constexpr quint32 tabKeyCode = 23;

    QQuickWindow m_window;
    FVColorPickerViewController m_picker;
    int m_frames = 0;
    int m_framesAtReady = 0;
    int m_picks = 0;
    int m_dragStep = 0;
};

} // namespace favrin::bench
