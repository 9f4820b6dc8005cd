#include "eyedropper/eyedropperavailability.h"

#include "eyedropper/wirenames.h"

#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QDBusServiceWatcher>

#include <utility>

namespace favrin::eyedropper {

namespace {

/** The service is there, and merely does not know the question. */
bool doesNotKnowTheQuestion(QDBusError::ErrorType error)
{
    return error == QDBusError::UnknownMethod || error == QDBusError::UnknownInterface ||
           error == QDBusError::UnknownObject;
}

} // namespace

EyedropperAvailability::EyedropperAvailability(QString busAddress, QObject *parent)
    : QObject(parent), m_busAddress(std::move(busAddress))
{
}

EyedropperAvailability::~EyedropperAvailability() = default;

void EyedropperAvailability::ask()
{
    if (m_connection) {
        if (m_connection->bus())
            askService();
        return;
    }
    m_connection = std::make_unique<BusConnection>(m_busAddress);
    connect(m_connection.get(), &BusConnection::opened, this, [this] {
        watchService();
        askService();
    });
    const auto noBus = [this] {
        // Asked again, it tries again.
        delete std::exchange(m_watcher, nullptr);
        m_connection.release()->deleteLater();
        m_asking = false;
        setAvailable(false);
    };
    connect(m_connection.get(), &BusConnection::failed, this, noBus);
    connect(m_connection.get(), &BusConnection::lost, this, noBus);
    m_connection->open();
}

void EyedropperAvailability::watchService()
{
    m_watcher =
        new QDBusServiceWatcher(serviceName, *m_connection->bus(), QDBusServiceWatcher::WatchForOwnerChange, this);
    connect(m_watcher, &QDBusServiceWatcher::serviceOwnerChanged, this,
            [this](const QString &, const QString &, const QString &newOwner) { serviceChangedOwner(newOwner); });
}

void EyedropperAvailability::askService()
{
    if (std::exchange(m_asking, true))
        return;
    const auto question = QDBusMessage::createMethodCall(serviceName, servicePath, availabilityInterface,
                                                         QStringLiteral("eyedropperIsAvailable"));
    auto *answer = new QDBusPendingCallWatcher(m_connection->bus()->asyncCall(question), m_connection.get());
    connect(answer, &QDBusPendingCallWatcher::finished, this, [this, answer] {
        const QDBusPendingReply<bool> reply = *answer;
        answer->deleteLater();
        m_asking = false;
        setAvailable(reply.isError() ? doesNotKnowTheQuestion(reply.error().type()) : reply.value());
    });
}

void EyedropperAvailability::serviceChangedOwner(const QString &newOwner)
{
    // One that left is not asked, because that would start it again.
    if (newOwner.isEmpty())
        askWhetherActivatable();
    else
        askService();
}

void EyedropperAvailability::askWhetherActivatable()
{
    const auto question =
        QDBusMessage::createMethodCall(QStringLiteral("org.freedesktop.DBus"), QStringLiteral("/org/freedesktop/DBus"),
                                       QStringLiteral("org.freedesktop.DBus"), QStringLiteral("ListActivatableNames"));
    auto *answer = new QDBusPendingCallWatcher(m_connection->bus()->asyncCall(question), m_connection.get());
    connect(answer, &QDBusPendingCallWatcher::finished, this, [this, answer] {
        const QDBusPendingReply<QStringList> reply = *answer;
        answer->deleteLater();
        if (reply.isError() || !reply.value().contains(serviceName))
            setAvailable(false);
    });
}

void EyedropperAvailability::setAvailable(bool available)
{
    const bool wasKnown = std::exchange(m_known, true);
    if (std::exchange(m_available, available) != available || !wasKnown)
        Q_EMIT changed();
}

} // namespace favrin::eyedropper
