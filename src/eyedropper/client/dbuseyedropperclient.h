#pragma once

#include "eyedropper/client/edserviceserverproxy.h"
#include "service/eyedropperclient.h"

#include <QObject>

#include <memory>
#include <optional>

namespace favrin::eyedropper {

class ServiceConnection;

/**
 * The picker's client of the eyedropper service on the session bus. It connects with the first request and keeps the
 * connection while it lives; when the service goes, the next request connects anew. A service that cannot be reached is
 * logged and nothing else: the request is lost. Main thread; no request waits, and none calls the delegate.
 */
class DBusEyedropperClient : public QObject, public service::EyedropperClient
{
    Q_OBJECT

public:
    /** @p delegate outlives the client; @p busAddress names a bus, empty it is that of the session. */
    explicit DBusEyedropperClient(service::EyedropperClientDelegate &delegate, QString busAddress = {});
    ~DBusEyedropperClient() override;

    void invoke(const std::string &displayIdentifier) override;
    void floatEyedropper() override;
    void cancel() override;

private:
    void createServerProxyIfNeeded();
    void forgetConnection();

    service::EyedropperClientDelegate &m_delegate;
    QString m_busAddress;
    std::unique_ptr<ServiceConnection> m_connection;
    std::optional<EDServiceServerProxy> m_serverProxy;
};

} // namespace favrin::eyedropper
