#pragma once

#include <QObject>
#include <QTimer>

namespace favrin::host {

class RemoteViewSession;

/**
 * Asks a picker's process again and again whether it is alive, while it is used: when nobody has told it anything for a
 * while and it has answered, nobody is woken up any more. One that is merely slow answers late. Waiting is counted in
 * questions that were due, not by the clock: while the app itself stands still or the machine sleeps, nobody is
 * accused. GUI thread.
 */
class ServiceWatch : public QObject
{
    Q_OBJECT

public:
    /** @p session must live as long as this. */
    explicit ServiceWatch(RemoteViewSession &session, QObject *parent = nullptr);

Q_SIGNALS:
    /** The process does not answer, or answers again. */
    void respondingChanged(bool responding);
    /** It has not answered for so long that it never will; sent once. */
    void gaveUp();

private:
    void ask();
    void sessionDidTell();
    void responsivenessDidChange(bool responsive);

    RemoteViewSession &m_session;
    QTimer m_timer;
    bool m_responding = true;
    /** The process has heard something since it was asked last. */
    bool m_told = true;
    bool m_asking = false;
    int m_unanswered = 0;
};

} // namespace favrin::host
