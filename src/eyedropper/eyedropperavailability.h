#pragma once

#include "eyedropper/busconnection.h"

#include <memory>

class QDBusServiceWatcher;

namespace favrin::eyedropper {

/**
 * Whether an eyedropper can work here, known before the user tries: whether there is an eyedropper service, running or
 * to be started by the bus, and whether it has a screen to sample. The service is asked, because it is the one that
 * will run; one that does not know the question counts as working. Nothing waits. Main thread.
 */
class EyedropperAvailability : public QObject
{
    Q_OBJECT

public:
    /** @p busAddress names a bus; empty, it is the bus of the session. Nothing is asked yet. */
    explicit EyedropperAvailability(QString busAddress = {}, QObject *parent = nullptr);
    ~EyedropperAvailability() override;

    /** False until an answer says otherwise. */
    bool isAvailable() const { return m_available; }
    /** An answer is there; a service that comes or goes later may change it. */
    bool isKnown() const { return m_known; }
    /** Asks, or asks again. */
    void ask();

Q_SIGNALS:
    /** An answer has come, or is another one than before. */
    void changed();

private:
    void watchService();
    void askService();
    void serviceChangedOwner(const QString &newOwner);
    void askWhetherActivatable();
    void setAvailable(bool available);

    QString m_busAddress;
    std::unique_ptr<BusConnection> m_connection;
    QDBusServiceWatcher *m_watcher = nullptr;
    bool m_asking = false;
    bool m_available = false;
    bool m_known = false;
};

} // namespace favrin::eyedropper
