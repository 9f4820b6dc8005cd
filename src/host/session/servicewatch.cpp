#include "host/session/servicewatch.h"

#include "host/session/remoteviewsession.h"

#include <utility>

namespace favrin::host {

using namespace std::chrono_literals;

namespace {

constexpr auto timeBetweenQuestions = 2000ms;
/** Questions that are due while one is open. The first is reported, the last ends the picker. */
constexpr int mostUnanswered = 5;
/** Likewise, for a process that still loads its libraries. */
constexpr int mostUnansweredAtStart = 15;

} // namespace

ServiceWatch::ServiceWatch(RemoteViewSession &session, QObject *parent) : QObject(parent), m_session(session)
{
    connect(&session, &RemoteViewSession::responsivenessDidChange, this, &ServiceWatch::responsivenessDidChange);
    connect(&m_timer, &QTimer::timeout, this, &ServiceWatch::ask);
    connect(&session, &RemoteViewSession::told, this, &ServiceWatch::sessionDidTell);
    m_timer.start(timeBetweenQuestions);
}

void ServiceWatch::sessionDidTell()
{
    if (m_asking)
        return;
    m_told = true;
    if (!m_timer.isActive())
        m_timer.start();
}

void ServiceWatch::ask()
{
    if (m_session.isTelling())
        return;
    // The answer may be here already: after a standstill of the app its timers come before its sockets.
    m_session.receive();
    if (m_session.hasEnded())
        return;
    m_asking = true;
    m_session.server().ping();
    m_session.flush();
    m_asking = false;
    if (m_responding) {
        if (!std::exchange(m_told, false))
            m_timer.stop();
        return;
    }
    if (++m_unanswered < (m_session.isReady() ? mostUnanswered : mostUnansweredAtStart))
        return;
    m_timer.stop();
    Q_EMIT gaveUp();
}

void ServiceWatch::responsivenessDidChange(bool responsive)
{
    m_responding = responsive;
    m_unanswered = 0;
    m_told = true;
    Q_EMIT respondingChanged(responsive);
}

} // namespace favrin::host
