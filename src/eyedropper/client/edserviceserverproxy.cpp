#include "eyedropper/client/edserviceserverproxy.h"

#include "eyedropper/client/serviceconnection.h"

namespace favrin::eyedropper {

void EDServiceServerProxy::beginShowingEyeDropper(const QString &displayIdentifier) const
{
    m_connection.send(QStringLiteral("beginShowingEyeDropper"), {displayIdentifier});
}

void EDServiceServerProxy::floatEyeDropper() const
{
    m_connection.send(QStringLiteral("floatEyeDropper"));
}

void EDServiceServerProxy::cancelShowingEyeDropper() const
{
    m_connection.send(QStringLiteral("cancelShowingEyeDropper"));
}

} // namespace favrin::eyedropper
