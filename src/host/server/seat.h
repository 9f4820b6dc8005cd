#pragma once

#include "host/server/keyboard.h"
#include "host/server/pointer.h"
#include "host/server/touch.h"

#include <array>

namespace favrin::host::server {

class Connection;
class Surface;

/** wl_seat: the one user, with pointer, keyboard and touch. All input goes to the picker's surface. */
class Seat
{
public:
    explicit Seat(Connection &connection);

    Pointer &pointer() { return m_pointer; }
    Keyboard &keyboard() { return m_keyboard; }
    const Keyboard &keyboard() const { return m_keyboard; }
    Touch &touch() { return m_touch; }

    /** There is a keyboard; until then there are a pointer and touches only. */
    void offerKeyboard();
    /** Where input goes from now on; null takes it away. */
    void setSurface(Surface *surface);
    /** Before the owner waits: sends motion that was held back, if there is room now, and ends open groups of events.
     */
    void settle();

private:
    static const void *requests();
    void bind(wl_client *client, int version, std::uint32_t id);
    void sendCapabilities(wl_resource *seat) const;

    ResourceList m_resources;
    Pointer m_pointer;
    Keyboard m_keyboard;
    Touch m_touch;
    bool m_hasKeyboard = false;
};

} // namespace favrin::host::server
