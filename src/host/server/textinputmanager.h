#pragma once

#include "host/server/remoteviewserver.h"
#include "host/server/resource.h"

#include <string>

namespace favrin::host::server {

class Connection;
class TextInput;

/** zwp_text_input_manager_v1: knows the text field that has the focus, tells of its state, and writes into it. */
class TextInputManager
{
public:
    explicit TextInputManager(Connection &connection);

    void commit(const std::string &text);
    void preedit(const std::string &text, int cursor);
    void deleteSurrounding(std::uint32_t before, std::uint32_t after);
    /** At the end of a turn: tells the delegate what changed, once. */
    void settle();

    Connection &connection() { return m_connection; }
    void activate(TextInput &input);
    void deactivate(TextInput &input);

private:
    static const void *requests();
    void bind(wl_client *client, int version, std::uint32_t id);

    Connection &m_connection;
    ResourceList m_resources;
    TextInput *m_active = nullptr;
    TextInputState m_told;
};

} // namespace favrin::host::server
