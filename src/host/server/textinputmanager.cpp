#include "host/server/textinputmanager.h"

#include "host/server/connection.h"
#include "host/server/textinput.h"
#include "remote/wiretext.h"
#include "text-input-unstable-v1-server-protocol.h"

namespace favrin::host::server {

namespace {

constexpr int offeredVersion = 1;

} // namespace

const void *TextInputManager::requests()
{
    static const struct zwp_text_input_manager_v1_interface table = {
        [](wl_client *client, wl_resource *r, std::uint32_t id) {
            makeResource<TextInput>(client, zwp_text_input_v1_interface, wl_resource_get_version(r), id,
                                    *static_cast<TextInputManager *>(wl_resource_get_user_data(r)));
        }};
    return &table;
}

TextInputManager::TextInputManager(Connection &connection) : m_connection(connection)
{
    offerGlobal<&TextInputManager::bind>(connection.display(), zwp_text_input_manager_v1_interface, offeredVersion,
                                         this);
}

void TextInputManager::bind(wl_client *client, int version, std::uint32_t id)
{
    m_resources.add(client, zwp_text_input_manager_v1_interface, version, id, requests(), this);
}

void TextInputManager::commit(const std::string &text)
{
    if (m_active && remote::isWireText(text))
        m_active->commit(text);
}

void TextInputManager::preedit(const std::string &text, int cursor)
{
    if (m_active && remote::isWireText(text))
        m_active->preedit(text, cursor);
}

void TextInputManager::deleteSurrounding(std::uint32_t before, std::uint32_t after)
{
    if (m_active)
        m_active->deleteSurrounding(before, after);
}

void TextInputManager::settle()
{
    const TextInputState state = m_active ? m_active->state() : TextInputState();
    if (state == m_told)
        return;
    m_told = state;
    m_connection.delegate().textInputDidChange(m_told);
}

void TextInputManager::activate(TextInput &input)
{
    if (m_active && m_active != &input)
        m_active->setActive(false);
    m_active = &input;
    input.setActive(true);
}

void TextInputManager::deactivate(TextInput &input)
{
    if (m_active != &input)
        return;
    m_active = nullptr;
    input.setActive(false);
}

} // namespace favrin::host::server
