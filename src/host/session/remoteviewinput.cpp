#include "host/session/remoteviewinput.h"

#include "host/session/clipboardbridge.h"
#include "host/session/inputmethodanswer.h"
#include "host/session/keyboardforwarder.h"
#include "host/session/pointerforwarder.h"

#include <QGuiApplication>
#include <QInputMethod>

#include <cmath>
#include <utility>

namespace favrin::host {

RemoteViewInput::RemoteViewInput()
    : m_pointer(std::make_unique<PointerForwarder>())
    , m_keyboard(std::make_unique<KeyboardForwarder>())
    , m_clipboard(std::make_unique<ClipboardBridge>())
{
}

RemoteViewInput::~RemoteViewInput() = default;

void RemoteViewInput::setSession(RemoteViewSession *session, QSizeF size, double ratio)
{
    if (m_session) {
        m_session->disconnect(this);
        m_session->surface().disconnect(this);
    }
    m_session = session;
    m_pointer->setSession(session);
    m_keyboard->setSession(session);
    m_clipboard->setSession(session);
    if (!session)
        return;
    connect(&session->surface(), &RemoteSurface::changed, this, &RemoteViewInput::surfaceDidChange);
    connect(session, &RemoteViewSession::frameArrived, this, [this] { m_pointer->serviceDidDraw(); });
    connect(session, &RemoteViewSession::textInputDidChange, this, &RemoteViewInput::textInputDidChange);
    connect(session, &RemoteViewSession::focusDidLeave, this, [this](remote::FocusDirection direction) {
        if (m_focused)
            Q_EMIT focusDidLeave(direction);
    });
    configureSurface(size, ratio);
    if (m_focused) {
        m_keyboard->focusIn();
        m_clipboard->setActive(true);
    }
}

void RemoteViewInput::configureSurface(QSizeF size, double ratio)
{
    if (!m_session || m_session->hasEnded() || size.width() < 1 || size.height() < 1)
        return;
    // Whole numbers only: a fractional scale is drawn larger and shown smaller.
    m_session->server().configure(static_cast<int>(std::lround(size.width())),
                                  static_cast<int>(std::lround(size.height())),
                                  static_cast<int>(std::ceil(ratio - 0.01)));
    m_session->flush();
}

void RemoteViewInput::frameWasShown()
{
    if (!m_session || m_session->hasEnded())
        return;
    m_session->frameWasShown();
}

void RemoteViewInput::focusIn(Qt::FocusReason reason)
{
    m_focused = true;
    m_keyboard->focusIn();
    m_clipboard->setActive(true);
    if (reason == Qt::TabFocusReason)
        enterFocus(remote::FocusDirection::Forward);
    else if (reason == Qt::BacktabFocusReason)
        enterFocus(remote::FocusDirection::Backward);
}

void RemoteViewInput::focusOut()
{
    m_focused = false;
    m_clipboard->setActive(false);
    m_keyboard->focusOut();
}

void RemoteViewInput::enterFocus(remote::FocusDirection direction)
{
    if (!m_session)
        return;
    m_session->server().sendFocusWillEnter(direction);
    m_session->flush();
}

bool RemoteViewInput::isTextWanted() const
{
    return m_session && m_session->textInput().enabled;
}

QVariant RemoteViewInput::answer(Qt::InputMethodQuery query) const
{
    return m_session ? inputMethodAnswer(m_session->textInput(), query) : QVariant();
}

void RemoteViewInput::textInputDidChange()
{
    const auto &state = m_session->textInput();
    const bool toggled = std::exchange(m_textWanted, state.enabled) != state.enabled;
    if (toggled)
        Q_EMIT textWantedDidChange(state.enabled);
    const bool forgotten = std::exchange(m_inputMethodResets, state.resets) != state.resets;
    if (!m_focused)
        return;
    if (toggled && state.enabled)
        m_clipboard->offer();
    auto *inputMethod = QGuiApplication::inputMethod();
    if (forgotten)
        inputMethod->reset();
    inputMethod->update(toggled ? Qt::ImQueryAll : Qt::ImQueryInput | Qt::ImHints);
    const bool wantsPanel = state.enabled && state.wantsInputPanel;
    if (std::exchange(m_inputPanelWanted, wantsPanel) != wantsPanel)
        inputMethod->setVisible(wantsPanel);
}

} // namespace favrin::host
