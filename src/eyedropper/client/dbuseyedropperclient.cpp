#include "eyedropper/client/dbuseyedropperclient.h"

#include "eyedropper/client/serviceconnection.h"
#include "service/colorpickerlog.h"

#include <QPointer>

namespace favrin::eyedropper {

DBusEyedropperClient::DBusEyedropperClient(service::EyedropperClientDelegate &delegate, QString busAddress)
    : m_delegate(delegate), m_busAddress(std::move(busAddress))
{
}

DBusEyedropperClient::~DBusEyedropperClient() = default;

void DBusEyedropperClient::createServerProxyIfNeeded()
{
    if (m_serverProxy)
        return;
    m_connection = std::make_unique<ServiceConnection>(m_delegate, m_busAddress);
    auto *connection = m_connection.get();
    connection->setInterruptionHandler([connection] { connection->invalidate(); });
    connection->setInvalidationHandler([weak = QPointer(this)] {
        if (weak)
            weak->forgetConnection();
    });
    connection->setErrorHandler([](const QString &description) {
        service::colorPickerLog().error("Error creating a remoteObjectProxy : " + description.toStdString());
    });
    connection->resume();
    m_serverProxy.emplace(*connection);
}

void DBusEyedropperClient::forgetConnection()
{
    // The connection is what calls this: it may go only when it has returned.
    m_connection.release()->deleteLater();
    m_serverProxy.reset();
}

void DBusEyedropperClient::invoke(const std::string &displayIdentifier)
{
    createServerProxyIfNeeded();
    m_serverProxy->beginShowingEyeDropper(QString::fromStdString(displayIdentifier));
}

void DBusEyedropperClient::floatEyedropper()
{
    createServerProxyIfNeeded();
    m_serverProxy->floatEyeDropper();
}

void DBusEyedropperClient::cancel()
{
    createServerProxyIfNeeded();
    m_serverProxy->cancelShowingEyeDropper();
}

} // namespace favrin::eyedropper
