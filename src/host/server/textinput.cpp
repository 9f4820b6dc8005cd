#include "host/server/textinput.h"

#include "host/server/connection.h"
#include "host/server/serverlimits.h"
#include "host/server/textinputmanager.h"
#include "remote/limits.h"
#include "remote/wiretext.h"
#include "text-input-unstable-v1-server-protocol.h"

#include <algorithm>
#include <string_view>

namespace favrin::host::server {

namespace {

TextInput &inputOf(wl_resource *resource)
{
    return *Resource::of<TextInput>(resource);
}

/** A position in @p text: within it, and not inside a character. */
std::uint32_t position(const std::string &text, std::uint32_t byte)
{
    return static_cast<std::uint32_t>(remote::cutToBytes(text, byte).size());
}

} // namespace

const void *TextInput::requests()
{
    static const struct zwp_text_input_v1_interface table = [] {
        struct zwp_text_input_v1_interface requests = {};
        requests.activate = [](wl_client *, wl_resource *r, wl_resource *, wl_resource *surface) {
            inputOf(r).activate(surface);
        };
        requests.deactivate = [](wl_client *, wl_resource *r, wl_resource *) {
            inputOf(r).m_manager.deactivate(inputOf(r));
        };
        requests.show_input_panel = [](wl_client *, wl_resource *r) { inputOf(r).showPanel(true); };
        requests.hide_input_panel = [](wl_client *, wl_resource *r) { inputOf(r).showPanel(false); };
        requests.reset = [](wl_client *, wl_resource *r) { ++inputOf(r).m_state.resets; };
        requests.set_surrounding_text = [](wl_client *, wl_resource *r, const char *text, std::uint32_t cursor,
                                           std::uint32_t anchor) {
            inputOf(r).setSurroundingText(text, cursor, anchor);
        };
        requests.set_content_type = [](wl_client *, wl_resource *r, std::uint32_t hint, std::uint32_t purpose) {
            inputOf(r).m_state.contentHints = hint;
            inputOf(r).m_state.contentPurpose = purpose;
        };
        requests.set_cursor_rectangle = [](wl_client *, wl_resource *r, std::int32_t x, std::int32_t y,
                                           std::int32_t width, std::int32_t height) {
            inputOf(r).m_state.cursorRectangle = {x, y, width, height};
        };
        requests.set_preferred_language = [](wl_client *, wl_resource *r, const char *language) {
            inputOf(r).setPreferredLanguage(language);
        };
        requests.commit_state = [](wl_client *, wl_resource *r, std::uint32_t serial) { inputOf(r).m_serial = serial; };
        requests.invoke_action = [](wl_client *, wl_resource *, std::uint32_t, std::uint32_t) {};
        return requests;
    }();
    return &table;
}

TextInput::TextInput(wl_resource *handle, TextInputManager &manager) : Resource(handle, requests()), m_manager(manager)
{
}

TextInput::~TextInput()
{
    m_manager.deactivate(*this);
}

void TextInput::activate(wl_resource *surface)
{
    m_surface.reset(surface);
    m_manager.activate(*this);
}

void TextInput::setActive(bool active)
{
    m_state.enabled = active;
    if (!m_manager.connection().admitsEvent())
        return;
    if (active && m_surface.get())
        zwp_text_input_v1_send_enter(handle(), m_surface.get());
    else
        zwp_text_input_v1_send_leave(handle());
}

// What is not UTF-8 or inside of a character says nothing; a text field that describes itself badly is no reason to go.
void TextInput::setSurroundingText(const char *text, std::uint32_t cursor, std::uint32_t anchor)
{
    if (!remote::isWireText(text, limits::surroundingTextBytes))
        return;
    m_state.surroundingText = text;
    m_state.cursor = position(m_state.surroundingText, cursor);
    m_state.anchor = position(m_state.surroundingText, anchor);
}

void TextInput::setPreferredLanguage(const char *language)
{
    if (remote::isWireText(language, remote::limits::textBytes))
        m_state.preferredLanguage = language;
}

void TextInput::showPanel(bool shown)
{
    m_state.wantsInputPanel = shown;
    if (m_manager.connection().admitsEvent())
        zwp_text_input_v1_send_input_panel_state(handle(), shown ? 1 : 0);
}

void TextInput::commit(const std::string &text)
{
    std::string_view rest = remote::cutToBytes(text, limits::inputTextBytes);
    while (!rest.empty() && m_manager.connection().admitsEvent()) {
        const std::string part(remote::cutToBytes(rest, limits::inputTextBytesPerEvent));
        zwp_text_input_v1_send_commit_string(handle(), m_serial, part.c_str());
        rest.remove_prefix(part.size());
    }
}

void TextInput::preedit(const std::string &text, int cursor)
{
    // The text goes out twice in one message: as what is shown, and as what is kept should the field lose the focus.
    const std::string shown(remote::cutToBytes(text, limits::inputTextBytesPerEvent / 2));
    if (!m_manager.connection().admitsEvent())
        return;
    zwp_text_input_v1_send_preedit_cursor(handle(), std::min(cursor, static_cast<int>(shown.size())));
    zwp_text_input_v1_send_preedit_string(handle(), m_serial, shown.c_str(), shown.c_str());
}

void TextInput::deleteSurrounding(std::uint32_t before, std::uint32_t after)
{
    before = std::min(before, m_state.cursor);
    const auto size = static_cast<std::uint32_t>(m_state.surroundingText.size());
    after = std::min(after, size - m_state.cursor);
    if (before + after == 0 || !m_manager.connection().admitsEvent())
        return;
    // A deletion is part of the commit that follows it, even of an empty one.
    zwp_text_input_v1_send_delete_surrounding_text(handle(), -static_cast<std::int32_t>(before), before + after);
    zwp_text_input_v1_send_commit_string(handle(), m_serial, "");
}

} // namespace favrin::host::server
