#pragma once

#include <QString>

namespace favrin::eyedropper {

class ServiceConnection;

/** The eyedropper service as its client sees it. Every message is one-way. Must not outlive the connection. */
class EDServiceServerProxy
{
public:
    explicit EDServiceServerProxy(ServiceConnection &connection) : m_connection(connection) {}

    void beginShowingEyeDropper(const QString &displayIdentifier) const;
    void floatEyeDropper() const;
    void cancelShowingEyeDropper() const;

private:
    ServiceConnection &m_connection;
};

} // namespace favrin::eyedropper
