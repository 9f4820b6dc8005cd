#include "host/session/keyboardforwarder.h"

#include "host/session/remoteviewsession.h"

#include <QInputMethodEvent>
#include <QKeyEvent>

#include <array>
#include <utility>

#include <xkbcommon/xkbcommon-keysyms.h>
#include <xkbcommon/xkbcommon.h>

namespace favrin::host {

namespace {

/** X11 and Wayland count key codes from 8 on. */
constexpr quint32 scanCodeOffset = 8;
/** The real modifiers of a keymap, in their fixed order. */
constexpr std::uint32_t shiftMask = 1u << 0;
constexpr std::uint32_t controlMask = 1u << 2;
constexpr std::uint32_t altMask = 1u << 3;
constexpr std::uint32_t metaMask = 1u << 6;
constexpr std::uint32_t realModifiers = 0xff;
constexpr int groupShift = 13;
constexpr std::uint32_t groupMask = 3;

struct NamedKey
{
    int key;
    std::uint32_t keysym;
};

constexpr std::array<NamedKey, 20> namedKeys = {{
    {Qt::Key_Escape, XKB_KEY_Escape}, {Qt::Key_Tab, XKB_KEY_Tab},
    {Qt::Key_Backtab, XKB_KEY_Tab},   {Qt::Key_Backspace, XKB_KEY_BackSpace},
    {Qt::Key_Return, XKB_KEY_Return}, {Qt::Key_Enter, XKB_KEY_KP_Enter},
    {Qt::Key_Insert, XKB_KEY_Insert}, {Qt::Key_Delete, XKB_KEY_Delete},
    {Qt::Key_Home, XKB_KEY_Home},     {Qt::Key_End, XKB_KEY_End},
    {Qt::Key_Left, XKB_KEY_Left},     {Qt::Key_Up, XKB_KEY_Up},
    {Qt::Key_Right, XKB_KEY_Right},   {Qt::Key_Down, XKB_KEY_Down},
    {Qt::Key_PageUp, XKB_KEY_Prior},  {Qt::Key_PageDown, XKB_KEY_Next},
    {Qt::Key_Shift, XKB_KEY_Shift_L}, {Qt::Key_Control, XKB_KEY_Control_L},
    {Qt::Key_Alt, XKB_KEY_Alt_L},     {Qt::Key_Menu, XKB_KEY_Menu},
}};

std::uint32_t keysymOf(const QKeyEvent &event)
{
    if (event.nativeVirtualKey() != 0)
        return event.nativeVirtualKey();
    for (const auto &named : namedKeys) {
        if (named.key == event.key())
            return named.keysym;
    }
    const auto text = event.text().toUcs4();
    if (!text.isEmpty())
        return xkb_utf32_to_keysym(text.first());
    return event.key() < 0x1000000 ? xkb_utf32_to_keysym(static_cast<std::uint32_t>(event.key())) : XKB_KEY_NoSymbol;
}

std::uint32_t modifierMask(Qt::KeyboardModifiers modifiers)
{
    std::uint32_t mask = 0;
    mask |= modifiers.testFlag(Qt::ShiftModifier) ? shiftMask : 0;
    mask |= modifiers.testFlag(Qt::ControlModifier) ? controlMask : 0;
    mask |= modifiers.testFlag(Qt::AltModifier) ? altMask : 0;
    mask |= modifiers.testFlag(Qt::MetaModifier) ? metaMask : 0;
    return mask;
}

/** What the input method replaces, counted by Qt in UTF-16 units from the cursor, as bytes before and after it. */
std::pair<std::uint32_t, std::uint32_t> bytesAroundCursor(const server::TextInputState &state,
                                                          const QInputMethodEvent &event)
{
    const auto bytes = QByteArray::fromStdString(state.surroundingText);
    const auto before = QString::fromUtf8(bytes.left(state.cursor));
    const auto after = QString::fromUtf8(bytes.mid(state.cursor));
    const int unitsBefore = std::max(0, -event.replacementStart());
    const int unitsAfter = std::max(0, event.replacementStart() + event.replacementLength());
    return {static_cast<std::uint32_t>(before.right(unitsBefore).toUtf8().size()),
            static_cast<std::uint32_t>(after.left(unitsAfter).toUtf8().size())};
}

} // namespace

void KeyboardForwarder::setSession(RemoteViewSession *session)
{
    m_session = session;
    m_focused = false;
}

void KeyboardForwarder::focusIn()
{
    if (!m_session || std::exchange(m_focused, true))
        return;
    m_session->server().keyboardEnter();
    m_session->flush();
}

void KeyboardForwarder::focusOut()
{
    if (!m_session || !std::exchange(m_focused, false))
        return;
    m_session->server().keyboardLeave();
    m_session->flush();
}

std::uint32_t KeyboardForwarder::evdevCode(const QKeyEvent &event) const
{
    if (event.nativeScanCode() > scanCodeOffset)
        return event.nativeScanCode() - scanCodeOffset;
    const auto code = m_session->server().keyCodeForKeysym(keysymOf(event));
    return code ? code->key : 0;
}

bool KeyboardForwarder::key(const QKeyEvent &event, bool pressed)
{
    if (!m_session)
        return false;
    if (event.isAutoRepeat())
        return true;
    const auto code = evdevCode(event);
    if (code == 0)
        return false;
    focusIn();
    const auto native = event.nativeModifiers();
    const auto mask = native != 0 ? native & realModifiers : modifierMask(event.modifiers());
    auto &server = m_session->server();
    server.keyboardModifiers(mask, 0, 0, (native >> groupShift) & groupMask);
    server.keyboardKey(m_session->now(), code, pressed);
    m_session->flush();
    return true;
}

void KeyboardForwarder::text(const QInputMethodEvent &event)
{
    if (!m_session)
        return;
    auto &server = m_session->server();
    if (event.replacementLength() > 0) {
        const auto [before, after] = bytesAroundCursor(m_session->textInput(), event);
        server.deleteSurroundingText(before, after);
    }
    if (!event.commitString().isEmpty())
        server.commitText(event.commitString().toStdString());
    int cursor = static_cast<int>(event.preeditString().size());
    for (const auto &attribute : event.attributes()) {
        if (attribute.type == QInputMethodEvent::Cursor)
            cursor = attribute.start;
    }
    server.preeditText(event.preeditString().toStdString(),
                       static_cast<int>(event.preeditString().left(cursor).toUtf8().size()));
    m_session->flush();
}

} // namespace favrin::host
