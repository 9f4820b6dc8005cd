#include "host/session/serviceahead.h"

#include "host/session/remoteviewsession.h"

#include <QCoreApplication>
#include <QPointer>

namespace favrin::host {

ServiceAhead &ServiceAhead::instance()
{
    // Owned by the application: what waits goes with it, while there still is an event loop to end it.
    static QPointer<ServiceAhead> ahead;
    if (!ahead)
        ahead = new ServiceAhead;
    if (!ahead->parent())
        ahead->setParent(QCoreApplication::instance());
    return *ahead;
}

ServiceAhead::ServiceAhead() = default;

void ServiceAhead::launch()
{
    if (!m_launched && !m_waiting)
        adopt(launchService(servicePath()));
}

void ServiceAhead::adopt(LaunchedService service)
{
    m_launched = std::make_unique<RemoteViewSession>();
    if (!m_launched->adopt(std::move(service)).isEmpty())
        m_launched.reset();
}

void ServiceAhead::start(const remote::Traits &traits)
{
    if (m_waiting)
        return;
    launch();
    m_waiting = std::move(m_launched);
    if (!m_waiting)
        return;
    m_gamut = traits.displayGamut;
    connect(m_waiting.get(), &RemoteViewSession::ready, this, &ServiceAhead::ready);
    // One that ends while it waits is simply not there when it is wanted.
    connect(m_waiting.get(), &RemoteViewSession::ended, this, [this] { m_waiting.release()->deleteLater(); });
    m_waiting->attend();
    m_waiting->server().sendTraits(traits);
    m_waiting->flush();
}

bool ServiceAhead::isReady() const
{
    return m_waiting && m_waiting->isReady();
}

std::unique_ptr<RemoteViewSession> ServiceAhead::take(const remote::Traits &traits, QString *error)
{
    if (m_launched)
        start(traits);
    if (m_waiting && !m_waiting->hasEnded() && m_gamut == traits.displayGamut) {
        m_waiting->disconnect(this);
        return std::move(m_waiting);
    }
    m_waiting.reset();
    auto session = std::make_unique<RemoteViewSession>();
    *error = session->start();
    return error->isEmpty() ? std::move(session) : nullptr;
}

} // namespace favrin::host
