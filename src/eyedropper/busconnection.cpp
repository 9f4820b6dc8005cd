#include "eyedropper/busconnection.h"

#include "platform/queue/queue.h"

#include <QDBusError>
#include <QFileInfo>
#include <QPointer>

#include <atomic>

namespace favrin::eyedropper {

namespace {

QString nextName()
{
    static std::atomic_int count = 0;
    return QStringLiteral("favrin-eyedropper-%1").arg(++count);
}

} // namespace

BusConnection::BusConnection(QString address, QObject *parent)
    : QObject(parent), m_address(std::move(address)), m_name(nextName())
{
}

BusConnection::~BusConnection()
{
    if (m_bus)
        QDBusConnection::disconnectFromBus(m_name);
}

bool BusConnection::sessionBusMayExist()
{
    if (qEnvironmentVariableIsSet("DBUS_SESSION_BUS_ADDRESS"))
        return true;
    const QString folder = qEnvironmentVariable("XDG_RUNTIME_DIR");
    return !folder.isEmpty() && QFileInfo::exists(folder + QStringLiteral("/bus"));
}

void BusConnection::open()
{
    platform::backgroundQueue().async([name = m_name, address = m_address, weak = QPointer(this)] {
        const QDBusConnection bus = address.isEmpty() ? QDBusConnection::connectToBus(QDBusConnection::SessionBus, name)
                                                      : QDBusConnection::connectToBus(address, name);
        const QString error = bus.isConnected() ? QString() : bus.lastError().message();
        platform::mainQueue().async([name, error, weak, isConnected = bus.isConnected()] {
            if (!weak || !isConnected)
                QDBusConnection::disconnectFromBus(name);
            if (weak)
                weak->settle(isConnected ? QString() : error.isEmpty() ? QStringLiteral("no session bus") : error);
        });
    });
}

void BusConnection::settle(const QString &error)
{
    if (!error.isEmpty()) {
        Q_EMIT failed(error);
        return;
    }
    m_bus.emplace(m_name);
    m_bus->connect({}, QStringLiteral("/org/freedesktop/DBus/Local"), QStringLiteral("org.freedesktop.DBus.Local"),
                   QStringLiteral("Disconnected"), this, SLOT(loseBus()));
    Q_EMIT opened();
}

void BusConnection::loseBus()
{
    Q_EMIT lost();
}

} // namespace favrin::eyedropper
