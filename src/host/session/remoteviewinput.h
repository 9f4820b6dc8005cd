#pragma once

#include "host/session/remoteviewsession.h"

#include <QObject>
#include <QPointer>
#include <QRegion>

#include <memory>

namespace favrin::host {

class ClipboardBridge;
class KeyboardForwarder;
class PointerForwarder;

/**
 * What everything that shows a picker's surface has in common, an item or a window: the way of the user's input to the
 * session, and what the session says about it. GUI thread.
 */
class RemoteViewInput : public QObject
{
    Q_OBJECT

public:
    RemoteViewInput();
    ~RemoteViewInput() override;

    /** Goes on with another session, or none, at a place of @p size points with @p ratio pixels for each of them. */
    void setSession(RemoteViewSession *session, QSizeF size, double ratio);
    RemoteViewSession *session() const { return m_session; }
    /** Tells the service that its place is another one. */
    void configureSurface(QSizeF size, double ratio);
    /** The newest frame of the service is on the screen: it may draw the next. */
    void frameWasShown();

    PointerForwarder &pointer() { return *m_pointer; }
    KeyboardForwarder &keyboard() { return *m_keyboard; }

    void focusIn(Qt::FocusReason reason);
    void focusOut();
    bool isFocused() const { return m_focused; }
    /** The focus enters the picker at the end that @p direction leads away from. */
    void enterFocus(remote::FocusDirection direction);

    /** The user types into a field: keys are text, and the input method is at work. */
    bool isTextWanted() const;
    /** Invalid without a session. */
    QVariant answer(Qt::InputMethodQuery query) const;

Q_SIGNALS:
    /** The surface holds a new picture; pixels, everything when @p resized. */
    void surfaceDidChange(const QRegion &damage, bool resized);
    void textWantedDidChange(bool wanted);
    /** The user tabbed out of the picker. */
    void focusDidLeave(remote::FocusDirection direction);

private:
    void textInputDidChange();

    QPointer<RemoteViewSession> m_session;
    std::unique_ptr<PointerForwarder> m_pointer;
    std::unique_ptr<KeyboardForwarder> m_keyboard;
    std::unique_ptr<ClipboardBridge> m_clipboard;
    bool m_focused = false;
    bool m_textWanted = false;
    std::uint32_t m_inputMethodResets = 0;
    bool m_inputPanelWanted = false;
};

} // namespace favrin::host
