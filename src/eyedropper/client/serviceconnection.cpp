#include "eyedropper/client/serviceconnection.h"

#include "eyedropper/wirenames.h"

#include <QDBusError>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusServiceWatcher>

#include <utility>

namespace favrin::eyedropper {

ServiceConnection::ServiceConnection(service::EyedropperClientDelegate &exported, const QString &busAddress)
    : m_connection(busAddress), m_exportedClient(exported)
{
}

ServiceConnection::~ServiceConnection() = default;

void ServiceConnection::resume()
{
    connect(&m_connection, &BusConnection::opened, this, &ServiceConnection::findService);
    connect(&m_connection, &BusConnection::failed, this, &ServiceConnection::fail);
    connect(&m_connection, &BusConnection::lost, this, &ServiceConnection::invalidate);
    m_connection.open();
}

void ServiceConnection::findService()
{
    if (!m_valid)
        return;
    QDBusConnection bus = *m_connection.bus();
    bus.registerObject(clientPath, &m_exportedClient);
    // Before the questions, so that no change of owner is missed between their answers and the first message.
    auto *watcher = new QDBusServiceWatcher(serviceName, bus, QDBusServiceWatcher::WatchForOwnerChange, this);
    connect(watcher, &QDBusServiceWatcher::serviceOwnerChanged, this,
            [this](const QString &, const QString &, const QString &newOwner) { ownerChanged(newOwner); });
    // Asked for first: the bus can start only services that are installed, and one may run that is not.
    askForOwner([this](const QString &) { startService(); });
}

void ServiceConnection::startService()
{
    callBus(
        QStringLiteral("StartServiceByName"), {QString(serviceName), 0U},
        [this](const QVariant &) { askForOwner([this](const QString &reason) { fail(reason); }); },
        [this](const QString &reason) { fail(reason); });
}

void ServiceConnection::askForOwner(const ErrorHandler &failed)
{
    callBus(
        QStringLiteral("GetNameOwner"), {QString(serviceName)},
        [this](const QVariant &owner) { serviceFound(owner.toString()); }, failed);
}

void ServiceConnection::callBus(const QString &member, const QVariantList &arguments,
                                const std::function<void(const QVariant &)> &answered, const ErrorHandler &failed)
{
    auto question =
        QDBusMessage::createMethodCall(QStringLiteral("org.freedesktop.DBus"), QStringLiteral("/org/freedesktop/DBus"),
                                       QStringLiteral("org.freedesktop.DBus"), member);
    question.setArguments(arguments);
    auto *watcher = new QDBusPendingCallWatcher(m_connection.bus()->asyncCall(question), this);
    connect(watcher, &QDBusPendingCallWatcher::finished, this, [this, watcher, answered, failed] {
        watcher->deleteLater();
        if (!m_valid)
            return;
        if (watcher->isError())
            failed(watcher->error().message());
        else
            answered(watcher->reply().arguments().value(0));
    });
}

void ServiceConnection::serviceFound(const QString &uniqueName)
{
    m_service = uniqueName;
    m_exportedClient.setService(uniqueName);
    for (const Message &message : std::exchange(m_waiting, {}))
        sendNow(message);
}

void ServiceConnection::ownerChanged(const QString &newOwner)
{
    if (!m_valid || m_service.isEmpty() || newOwner == m_service)
        return;
    if (m_interruptionHandler)
        m_interruptionHandler();
}

void ServiceConnection::fail(const QString &reason)
{
    if (m_errorHandler)
        m_errorHandler(reason);
    invalidate();
}

void ServiceConnection::send(const QString &member, const QVariantList &arguments)
{
    if (!m_valid)
        return;
    if (m_service.isEmpty())
        m_waiting.push_back({member, arguments});
    else
        sendNow({member, arguments});
}

void ServiceConnection::sendNow(const Message &message)
{
    auto call = QDBusMessage::createMethodCall(m_service, servicePath, serverInterface, message.member);
    call.setArguments(message.arguments);
    m_connection.bus()->send(call);
}

void ServiceConnection::invalidate()
{
    if (!std::exchange(m_valid, false))
        return;
    m_service.clear();
    m_exportedClient.setService({});
    m_waiting.clear();
    if (const auto handler = std::exchange(m_invalidationHandler, nullptr))
        handler();
}

} // namespace favrin::eyedropper
