#pragma once

#include <QObject>
#include <QTimer>

#include <deque>
#include <functional>

namespace favrin::gallery {

/**
 * Plays steps one after the other: each does something, then waits until what it was for has come true. A step whose
 * condition does not come true within a minute ends the tour with an error, so that a tour never hangs.
 */
class Tour : public QObject
{
    Q_OBJECT

public:
    using Action = std::function<void()>;
    using Condition = std::function<bool()>;

    explicit Tour(QObject *parent = nullptr);

    /** @param text what is done, or waited for, as printed and as named when it fails */
    void add(const QString &text, Action action, Condition isDone);
    void start();
    /** Ends the tour with an error. */
    void fail(const QString &reason);

Q_SIGNALS:
    /** Ended with an exit status for the process: 0 when every step came true. */
    void finished(int exitStatus);

private:
    struct Step
    {
        QString text;
        Action action;
        Condition isDone;
    };

    void beginStep();
    void check();
    void end(int exitStatus);

    std::deque<Step> m_steps;
    QTimer m_checking;
    QTimer m_watchdog;
};

} // namespace favrin::gallery
