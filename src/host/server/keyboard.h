#pragma once

#include "host/server/keymap.h"
#include "host/server/resource.h"

#include <deque>
#include <optional>
#include <vector>

namespace favrin::host::server {

class Connection;
class Surface;

/**
 * wl_keyboard: keymap, focus, keys and modifiers. What is typed into a picker that is still starting waits until the
 * picker has its keyboard and its surface.
 */
class Keyboard
{
public:
    explicit Keyboard(Connection &connection);

    void bind(wl_client *client, int version, std::uint32_t id);
    void setSurface(Surface *surface);

    void setKeymap(const std::string &text);
    void setKeymap(const Keymap::Names &names);
    void setRepeat(int keysPerSecond, int delayMilliseconds);
    const Keymap &keymap() const { return m_keymap; }
    /** The layout in use. */
    std::uint32_t group() const { return m_modifiers.group; }

    void enter();
    void leave();
    void press(std::uint32_t time, std::uint32_t key, bool pressed);
    void setModifiers(std::uint32_t depressed, std::uint32_t latched, std::uint32_t locked, std::uint32_t group);

private:
    struct Modifiers
    {
        std::uint32_t depressed = 0;
        std::uint32_t latched = 0;
        std::uint32_t locked = 0;
        std::uint32_t group = 0;

        bool operator==(const Modifiers &) const = default;
    };

    struct Key
    {
        std::uint32_t time = 0;
        std::uint32_t code = 0;
        bool pressed = false;
        Modifiers modifiers;
    };

    static const void *requests();
    bool isReachable() const { return m_hasFocus && m_surface.get() && !m_resources.isEmpty(); }
    void hold(const Key &key);
    void sendHeld();
    void send(const Key &key);
    void sendKeymap(wl_resource *keyboard);
    void sendKeymap();
    void sendRepeat(wl_resource *keyboard);
    void sendEnter(wl_resource *keyboard);
    void sendModifiers(wl_resource *keyboard);

    Connection &m_connection;
    ResourceList m_resources;
    WeakResource m_surface;
    Keymap m_keymap;
    Modifiers m_modifiers;
    std::vector<std::uint32_t> m_pressed;
    /** In their order; none any more once the service could be reached. */
    std::optional<std::deque<Key>> m_held = std::deque<Key>();
    bool m_hasFocus = false;
    int m_keysPerSecond = 25;
    int m_delayMilliseconds = 600;
};

} // namespace favrin::host::server
