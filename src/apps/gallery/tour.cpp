#include "apps/gallery/tour.h"

#include <chrono>
#include <cstdio>

namespace favrin::gallery {

using namespace std::chrono_literals;

Tour::Tour(QObject *parent) : QObject(parent)
{
    m_checking.setInterval(8ms);
    m_watchdog.setSingleShot(true);
    m_watchdog.setInterval(60s);
    connect(&m_checking, &QTimer::timeout, this, &Tour::check);
    connect(&m_watchdog, &QTimer::timeout, this,
            [this] { fail(QStringLiteral("this did not come about in a minute")); });
}

void Tour::add(const QString &text, Action action, Condition isDone)
{
    m_steps.push_back({text, std::move(action), std::move(isDone)});
}

void Tour::start()
{
    m_checking.start();
    beginStep();
}

void Tour::fail(const QString &reason)
{
    if (!m_checking.isActive())
        return;
    const QString text = m_steps.empty() ? QString() : m_steps.front().text;
    std::fprintf(stderr, "tour: FAILED at \"%s\": %s\n", qUtf8Printable(text), qUtf8Printable(reason));
    end(1);
}

void Tour::beginStep()
{
    if (m_steps.empty()) {
        end(0);
        return;
    }
    std::printf("tour: %s\n", qUtf8Printable(m_steps.front().text));
    std::fflush(stdout);
    m_watchdog.start();
    if (m_steps.front().action)
        m_steps.front().action();
}

void Tour::check()
{
    if (m_steps.empty() || !m_steps.front().isDone())
        return;
    // The condition itself may have ended the tour.
    if (!m_checking.isActive())
        return;
    m_steps.pop_front();
    beginStep();
}

void Tour::end(int exitStatus)
{
    m_checking.stop();
    m_watchdog.stop();
    Q_EMIT finished(exitStatus);
}

} // namespace favrin::gallery
