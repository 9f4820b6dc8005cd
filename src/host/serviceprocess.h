#pragma once

#include <QObject>
#include <QString>

#include <memory>

#include <sys/types.h>

class QSocketNotifier;

namespace favrin::host {

/**
 * One picker process: started with one end of a socket and nothing else of ours, reaped when it ends, killed when it
 * outlives its welcome. GUI thread. The object may be destroyed at any time; the process then ends by itself, since its
 * socket is closed.
 */
class ServiceProcess : public QObject
{
    Q_OBJECT

public:
    explicit ServiceProcess(QObject *parent = nullptr);
    ~ServiceProcess() override;

    /** The program that is run: "$FAVRIN_COLOR_PICKER_SERVICE", else beside the library or the app, else as installed.
     */
    static QString program();

    /**
     * Starts the program with @p socket, which is closed here in any case. An error text when it could not be started,
     * else an empty text.
     */
    QString start(int socket);
    /** Waits for the end of what was started. start() does so itself, except while there is no application yet. */
    void watch();
    /** 0 when nothing runs. */
    pid_t processIdentifier() const { return m_pid; }
    void kill();

Q_SIGNALS:
    /** @p description says how it ended, e.g. "exit status 1" or "signal 9". */
    void ended(const QString &description);

private:
    void reap();

    pid_t m_pid = 0;
    int m_pidDescriptor = -1;
    std::unique_ptr<QSocketNotifier> m_notifier;
};

} // namespace favrin::host
