#pragma once

#include <QObject>
#include <QPointer>

#include <string>
#include <vector>

namespace favrin::host {

class RemoteViewSession;

/**
 * Joins the host's clipboard and the service's while the picker has the focus. What the service copies is fetched at
 * once, without waiting for it, and then lies in the host's clipboard; what the host holds is written to the service
 * when it asks, off the main thread.
 */
class ClipboardBridge : public QObject
{
    Q_OBJECT

public:
    explicit ClipboardBridge(QObject *parent = nullptr);
    ~ClipboardBridge() override;

    void setSession(RemoteViewSession *session);
    /** The picker has the focus, or no longer: only then may it change or read the clipboard. */
    void setActive(bool active);
    /** Offers the host's clipboard. Asking for its types can be slow on some platforms: only for a text field in use.
     */
    void offer();

private:
    class Fetch;

    void fetch(const std::vector<std::string> &mimeTypes);
    void write(const std::string &mimeType, int descriptor);

    QPointer<RemoteViewSession> m_session;
    bool m_active = false;
    bool m_taking = false;
};

} // namespace favrin::host
