#include "host/session/serviceprocess.h"

#include <QSocketNotifier>
#include <QTimer>

#include <csignal>

#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

namespace favrin::host {

namespace {

using namespace std::chrono_literals;

constexpr auto timeBetweenLooks = 20ms;

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

void ServiceProcess::adopt(pid_t process)
{
    m_pid = process;
    m_pidDescriptor = static_cast<int>(syscall(SYS_pidfd_open, m_pid, 0));
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
    if (m_pid <= 0)
        return;
    ::kill(m_pid, SIGKILL);
    awaitEnd();
}

void ServiceProcess::awaitEnd()
{
    if (m_pidDescriptor >= 0 || m_pid <= 0 || m_look)
        return;
    m_look = std::make_unique<QTimer>();
    connect(m_look.get(), &QTimer::timeout, this, &ServiceProcess::reap);
    m_look->start(timeBetweenLooks);
}

void ServiceProcess::reap()
{
    siginfo_t info = {};
    // An app that reaps all children itself leaves nothing to wait for; the process has ended all the same.
    const bool isChild = waitid(P_PID, static_cast<id_t>(m_pid), &info, WEXITED | WNOHANG) == 0;
    const bool known = isChild && info.si_pid == m_pid;
    if (isChild && !known && m_look)
        return;
    m_pid = 0;
    if (m_notifier)
        m_notifier->setEnabled(false);
    if (m_look)
        m_look->stop();
    Q_EMIT ended(known ? describe(info) : QStringLiteral("ended"));
}

} // namespace favrin::host
