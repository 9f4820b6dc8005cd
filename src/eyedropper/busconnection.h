#pragma once

#include <QDBusConnection>
#include <QObject>

#include <optional>

namespace favrin::eyedropper {

/**
 * A connection to the session bus that belongs to its user alone, so that closing it says goodbye for this user only.
 * It is opened on another thread: a bus that does not answer holds nobody up. Used on the main thread, where its
 * signals arrive; destroying it closes the connection.
 */
class BusConnection : public QObject
{
    Q_OBJECT

public:
    /** @p address names a bus; empty, it is the bus of the session. */
    explicit BusConnection(QString address = {}, QObject *parent = nullptr);
    ~BusConnection() override;

    /** False when the environment tells of no session bus at all. */
    static bool sessionBusMayExist();

    /** Starts opening; opened() or failed() follows. Once only. */
    void open();
    /** The connection, when it is open. */
    const std::optional<QDBusConnection> &bus() const { return m_bus; }

Q_SIGNALS:
    void opened();
    void failed(const QString &error);
    /** The bus itself is gone. */
    void lost();

private Q_SLOTS:
    void loseBus();

private:
    void settle(const QString &error);

    QString m_address;
    QString m_name;
    std::optional<QDBusConnection> m_bus;
};

} // namespace favrin::eyedropper
