#include "host/server/keyboard.h"

#include "host/server/connection.h"
#include "host/server/sealedtext.h"
#include "host/server/surface.h"

#include <algorithm>
#include <utility>

#include <unistd.h>
#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

/** From here on, clients map the keymap privately. */
constexpr int privateMappingVersion = 7;
/** What a keyboard can hold down at a time, generously. */
constexpr std::size_t mostPressedKeys = 64;
/** More than anybody types while a picker starts. */
constexpr std::size_t mostHeldKeys = 128;

} // namespace

const void *Keyboard::requests()
{
    static const struct wl_keyboard_interface table = {destroyRequest};
    return &table;
}

Keyboard::Keyboard(Connection &connection) : m_connection(connection) {}

void Keyboard::bind(wl_client *client, int version, std::uint32_t id)
{
    wl_resource *keyboard = m_resources.add(client, wl_keyboard_interface, version, id, requests(), this);
    if (!keyboard)
        return;
    sendKeymap(keyboard);
    sendRepeat(keyboard);
    if (m_surface.get() && m_hasFocus)
        sendEnter(keyboard);
    sendHeld();
}

void Keyboard::setSurface(Surface *surface)
{
    m_surface.reset(surface ? surface->handle() : nullptr);
    if (surface && m_hasFocus)
        m_resources.forEach([this](wl_resource *keyboard) { sendEnter(keyboard); });
    sendHeld();
}

void Keyboard::setKeymap(const std::string &text)
{
    if (m_keymap.setText(text))
        sendKeymap();
}

void Keyboard::setKeymap(const Keymap::Names &names)
{
    if (m_keymap.setNames(names))
        sendKeymap();
}

void Keyboard::setRepeat(int keysPerSecond, int delayMilliseconds)
{
    m_keysPerSecond = std::max(keysPerSecond, 0);
    m_delayMilliseconds = std::max(delayMilliseconds, 0);
    m_resources.forEach([this](wl_resource *keyboard) { sendRepeat(keyboard); });
}

void Keyboard::enter()
{
    if (std::exchange(m_hasFocus, true))
        return;
    m_pressed.clear();
    if (m_surface.get())
        m_resources.forEach([this](wl_resource *keyboard) { sendEnter(keyboard); });
    sendHeld();
}

void Keyboard::leave()
{
    if (m_held)
        m_held->clear();
    if (!std::exchange(m_hasFocus, false) || !m_surface.get() || !m_connection.admitsEvent())
        return;
    const std::uint32_t serial = m_connection.nextSerial();
    m_resources.forEach([&](wl_resource *keyboard) { wl_keyboard_send_leave(keyboard, serial, m_surface.get()); });
}

void Keyboard::press(std::uint32_t time, std::uint32_t key, bool pressed)
{
    if (!m_hasFocus)
        return;
    if (m_held)
        hold({time, key, pressed, m_modifiers});
    else
        send({time, key, pressed, m_modifiers});
}

void Keyboard::hold(const Key &key)
{
    // A release without its press means nothing to anybody; a press without its release would repeat forever.
    if (m_held->size() == mostHeldKeys)
        m_held->pop_front();
    m_held->push_back(key);
}

void Keyboard::sendHeld()
{
    if (!m_held || !isReachable())
        return;
    const Modifiers now = m_modifiers;
    const auto held = std::exchange(m_held, std::nullopt);
    for (const Key &key : *held) {
        setModifiers(key.modifiers.depressed, key.modifiers.latched, key.modifiers.locked, key.modifiers.group);
        send(key);
    }
    setModifiers(now.depressed, now.latched, now.locked, now.group);
}

void Keyboard::send(const Key &key)
{
    std::erase(m_pressed, key.code);
    if (key.pressed && m_pressed.size() < mostPressedKeys)
        m_pressed.push_back(key.code);
    if (!m_surface.get() || !m_connection.admitsEvent())
        return;
    const std::uint32_t serial = m_connection.nextInputSerial();
    const auto state = key.pressed ? WL_KEYBOARD_KEY_STATE_PRESSED : WL_KEYBOARD_KEY_STATE_RELEASED;
    m_resources.forEach(
        [&](wl_resource *keyboard) { wl_keyboard_send_key(keyboard, serial, key.time, key.code, state); });
}

void Keyboard::setModifiers(std::uint32_t depressed, std::uint32_t latched, std::uint32_t locked, std::uint32_t group)
{
    const Modifiers modifiers = {depressed, latched, locked, group};
    if (std::exchange(m_modifiers, modifiers) == modifiers)
        return;
    if (m_hasFocus && m_surface.get())
        m_resources.forEach([this](wl_resource *keyboard) { sendModifiers(keyboard); });
}

void Keyboard::sendKeymap()
{
    m_resources.forEach([this](wl_resource *keyboard) { sendKeymap(keyboard); });
}

void Keyboard::sendKeymap(wl_resource *keyboard)
{
    if (!m_connection.admitsEvent())
        return;
    const bool isPrivate = wl_resource_get_version(keyboard) >= privateMappingVersion;
    const std::string &text = m_keymap.text();
    const int descriptor = sealedText(text, isPrivate ? Writable::No : Writable::Yes);
    if (descriptor < 0)
        return;
    const auto format = text.empty() ? WL_KEYBOARD_KEYMAP_FORMAT_NO_KEYMAP : WL_KEYBOARD_KEYMAP_FORMAT_XKB_V1;
    wl_keyboard_send_keymap(keyboard, format, descriptor, static_cast<std::uint32_t>(text.size() + 1));
    ::close(descriptor);
}

void Keyboard::sendRepeat(wl_resource *keyboard)
{
    if (wl_resource_get_version(keyboard) >= WL_KEYBOARD_REPEAT_INFO_SINCE_VERSION && m_connection.admitsEvent())
        wl_keyboard_send_repeat_info(keyboard, m_keysPerSecond, m_delayMilliseconds);
}

void Keyboard::sendEnter(wl_resource *keyboard)
{
    if (!m_connection.admitsEvent())
        return;
    wl_array keys = {m_pressed.size() * sizeof(std::uint32_t), 0, m_pressed.data()};
    wl_keyboard_send_enter(keyboard, m_connection.nextInputSerial(), m_surface.get(), &keys);
    sendModifiers(keyboard);
}

void Keyboard::sendModifiers(wl_resource *keyboard)
{
    if (m_connection.admitsEvent())
        wl_keyboard_send_modifiers(keyboard, m_connection.nextSerial(), m_modifiers.depressed, m_modifiers.latched,
                                   m_modifiers.locked, m_modifiers.group);
}

} // namespace favrin::host::server
