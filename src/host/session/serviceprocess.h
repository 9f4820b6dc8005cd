#pragma once

#include <QObject>
#include <QString>

#include <memory>

#include <sys/types.h>

class QSocketNotifier;
class QTimer;

namespace favrin::host {

/**
 * One picker process: reaped when it ends, killed when it outlives its welcome. GUI thread. The object may be destroyed
 * at any time; the process then ends by itself, since its socket is closed.
 */
class ServiceProcess : public QObject
{
    Q_OBJECT

public:
    explicit ServiceProcess(QObject *parent = nullptr);
    ~ServiceProcess() override;

    /** Takes over what was started; watch() tells of its end, when there is an event loop. */
    void adopt(pid_t process);
    void watch();
    /** 0 when nothing runs. */
    pid_t processIdentifier() const { return m_pid; }
    void kill();
    /**
     * The process is to end now, by itself or because it was killed. Where the system has no descriptors of processes,
     * as in some containers, nothing tells of it: from here on this looks for itself.
     */
    void awaitEnd();

Q_SIGNALS:
    /** @p description says how it ended, e.g. "exit status 1" or "signal 9". */
    void ended(const QString &description);

private:
    void reap();

    pid_t m_pid = 0;
    int m_pidDescriptor = -1;
    std::unique_ptr<QSocketNotifier> m_notifier;
    std::unique_ptr<QTimer> m_look;
};

} // namespace favrin::host
