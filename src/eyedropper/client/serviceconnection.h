#pragma once

#include "eyedropper/busconnection.h"
#include "eyedropper/client/exportedclient.h"

#include <QVariantList>

#include <functional>
#include <vector>

namespace favrin::eyedropper {

/**
 * One connection to the eyedropper service, which the bus starts when it does not run. Made, given its handlers and
 * resumed, it finds the service by itself; messages given to it meanwhile follow in their order as soon as that is
 * done. All messages go to the one process that was found: another that takes its name over is another service, and the
 * end of the one that was found interrupts the connection. Main thread; nothing waits.
 */
class ServiceConnection : public QObject
{
    Q_OBJECT

public:
    /** Takes a reason. */
    using ErrorHandler = std::function<void(const QString &)>;

    /** @p exported hears what the service reports; @p busAddress names a bus, empty it is that of the session. */
    ServiceConnection(service::EyedropperClientDelegate &exported, const QString &busAddress);
    ~ServiceConnection() override;

    /** Called when the service has gone. */
    void setInterruptionHandler(std::function<void()> handler) { m_interruptionHandler = std::move(handler); }
    /** Called once, when the connection can no longer be used. */
    void setInvalidationHandler(std::function<void()> handler) { m_invalidationHandler = std::move(handler); }
    /** Called with the reason when messages are lost because the service cannot be reached; invalidation follows. */
    void setErrorHandler(ErrorHandler handler) { m_errorHandler = std::move(handler); }

    void resume();
    /** Sends a message that has no answer. */
    void send(const QString &member, const QVariantList &arguments = {});
    /** Gives the connection up: nothing is sent any more, and whatever still comes from the service is refused. */
    void invalidate();

private:
    struct Message
    {
        QString member;
        QVariantList arguments;
    };

    void findService();
    void startService();
    void askForOwner(const ErrorHandler &failed);
    void serviceFound(const QString &uniqueName);
    void ownerChanged(const QString &newOwner);
    void fail(const QString &reason);
    void sendNow(const Message &message);
    /** Calls the bus; @p answered gets the first value of its reply, @p failed the reason why there is none. */
    void callBus(const QString &member, const QVariantList &arguments,
                 const std::function<void(const QVariant &)> &answered, const ErrorHandler &failed);

    BusConnection m_connection;
    ExportedClient m_exportedClient;
    std::function<void()> m_interruptionHandler;
    std::function<void()> m_invalidationHandler;
    ErrorHandler m_errorHandler;
    QString m_service;
    std::vector<Message> m_waiting;
    bool m_valid = true;
};

} // namespace favrin::eyedropper
