#pragma once

#include <QPointer>

#include <cstdint>

class QInputMethodEvent;
class QKeyEvent;

namespace favrin::host {

class RemoteViewSession;

/**
 * Passes keys on to a session, with the keymap of the host's seat where the platform tells it, and text of the host's
 * input method. Repeats are left to the service, which is told the host's rate.
 */
class KeyboardForwarder
{
public:
    void setSession(RemoteViewSession *session);
    void focusIn();
    void focusOut();
    /** False for a key that has no code in the keymap. */
    bool key(const QKeyEvent &event, bool pressed);
    void text(const QInputMethodEvent &event);

private:
    std::uint32_t evdevCode(const QKeyEvent &event) const;

    QPointer<RemoteViewSession> m_session;
    bool m_focused = false;
};

} // namespace favrin::host
