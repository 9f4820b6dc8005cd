#pragma once

#include "host/session/launchedservice.h"
#include "remote/records.h"

#include <QObject>

#include <memory>

namespace favrin::host {

class RemoteViewSession;

/** Keeps at most one picker process that was started before anybody asked for it. GUI thread. */
class ServiceAhead : public QObject
{
    Q_OBJECT

public:
    static ServiceAhead &instance();

    /** Starts the process alone, unless one waits already: all that can be done before there is an application. */
    void launch();
    /** Keeps one that was started even before. */
    void adopt(LaunchedService service);
    /** Starts one with these traits, or goes on with the one that was launched, unless one waits already. */
    void start(const remote::Traits &traits);
    bool isReady() const;
    /**
     * The waiting session, or a new one when none waits or the one that waits was built for a display of another gamut,
     * which a process cannot change. Null with @p error when no process can be started.
     */
    std::unique_ptr<RemoteViewSession> take(const remote::Traits &traits, QString *error);

Q_SIGNALS:
    void ready();

private:
    ServiceAhead();

    std::unique_ptr<RemoteViewSession> m_launched;
    std::unique_ptr<RemoteViewSession> m_waiting;
    remote::DisplayGamut m_gamut = remote::DisplayGamut::SRGB;
};

} // namespace favrin::host
