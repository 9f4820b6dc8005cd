#pragma once

#include "host/server/remoteviewserver.h"
#include "host/server/resource.h"

#include <string>

namespace favrin::host::server {

class TextInputManager;

/** zwp_text_input_v1: one text field of the service, as it describes itself. */
class TextInput : public Resource
{
public:
    TextInput(wl_resource *handle, TextInputManager &manager);
    ~TextInput() override;

    const TextInputState &state() const { return m_state; }
    void setActive(bool active);

    void commit(const std::string &text);
    void preedit(const std::string &text, int cursor);
    void deleteSurrounding(std::uint32_t before, std::uint32_t after);

private:
    static const void *requests();
    void activate(wl_resource *surface);
    void setSurroundingText(const char *text, std::uint32_t cursor, std::uint32_t anchor);
    void setPreferredLanguage(const char *language);
    void showPanel(bool shown);

    TextInputManager &m_manager;
    WeakResource m_surface;
    TextInputState m_state;
    /** Serial of the newest state that the service has committed. */
    std::uint32_t m_serial = 0;
};

} // namespace favrin::host::server
