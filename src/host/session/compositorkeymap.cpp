#include "host/session/compositorkeymap.h"

#include <cstdint>
#include <memory>
#include <string_view>

#include <sys/mman.h>
#include <unistd.h>

#include <wayland-client.h>

namespace favrin::host {

namespace {

/** The first seat of a compositor, what it has, and the keymap of its keyboard. */
class SeatReader
{
public:
    explicit SeatReader(wl_display *display)
        : m_display(display), m_queue(wl_display_create_queue(display), wl_event_queue_destroy)
    {
    }
    SeatReader(const SeatReader &) = delete;
    SeatReader &operator=(const SeatReader &) = delete;
    ~SeatReader()
    {
        if (m_keyboard)
            wl_keyboard_destroy(m_keyboard);
        if (m_seat)
            wl_seat_destroy(m_seat);
        if (m_registry)
            wl_registry_destroy(m_registry);
    }

    std::string read()
    {
        if (!findSeat() || !(m_capabilities & WL_SEAT_CAPABILITY_KEYBOARD))
            return {};
        // Only now: asking a seat for a keyboard that it never had is a protocol error.
        static constexpr wl_keyboard_listener listener = {
            .keymap = takeKeymap,
            .enter = [](void *, wl_keyboard *, uint32_t, wl_surface *, wl_array *) {},
            .leave = [](void *, wl_keyboard *, uint32_t, wl_surface *) {},
            .key = [](void *, wl_keyboard *, uint32_t, uint32_t, uint32_t, uint32_t) {},
            .modifiers = [](void *, wl_keyboard *, uint32_t, uint32_t, uint32_t, uint32_t, uint32_t) {},
            .repeat_info = [](void *, wl_keyboard *, int32_t, int32_t) {},
        };
        m_keyboard = wl_seat_get_keyboard(m_seat);
        wl_keyboard_add_listener(m_keyboard, &listener, this);
        roundtrip();
        return m_keymap;
    }

private:
    bool findSeat()
    {
        auto *wrapper = m_queue ? static_cast<wl_display *>(wl_proxy_create_wrapper(m_display)) : nullptr;
        if (!wrapper)
            return false;
        wl_proxy_set_queue(reinterpret_cast<wl_proxy *>(wrapper), m_queue.get());
        m_registry = wl_display_get_registry(wrapper);
        wl_proxy_wrapper_destroy(wrapper);
        static constexpr wl_registry_listener globals = {
            .global = takeGlobal,
            .global_remove = [](void *, wl_registry *, uint32_t) {},
        };
        wl_registry_add_listener(m_registry, &globals, this);
        roundtrip();
        if (!m_seat)
            return false;
        roundtrip();
        return true;
    }

    void roundtrip() { wl_display_roundtrip_queue(m_display, m_queue.get()); }

    static void takeGlobal(void *data, wl_registry *registry, uint32_t name, const char *interface, uint32_t)
    {
        auto &self = *static_cast<SeatReader *>(data);
        if (self.m_seat || std::string_view(interface) != wl_seat_interface.name)
            return;
        static constexpr wl_seat_listener listener = {
            .capabilities =
                [](void *reader, wl_seat *, uint32_t capabilities) {
                    static_cast<SeatReader *>(reader)->m_capabilities = capabilities;
                },
            .name = [](void *, wl_seat *, const char *) {},
        };
        self.m_seat = static_cast<wl_seat *>(wl_registry_bind(registry, name, &wl_seat_interface, 1));
        wl_seat_add_listener(self.m_seat, &listener, data);
    }

    static void takeKeymap(void *data, wl_keyboard *, uint32_t format, int32_t descriptor, uint32_t size)
    {
        if (format == WL_KEYBOARD_KEYMAP_FORMAT_XKB_V1 && size > 0) {
            void *memory = mmap(nullptr, size, PROT_READ, MAP_PRIVATE, descriptor, 0);
            if (memory != MAP_FAILED) {
                static_cast<SeatReader *>(data)->m_keymap.assign(static_cast<const char *>(memory), size - 1);
                munmap(memory, size);
            }
        }
        close(descriptor);
    }

    wl_display *m_display;
    std::unique_ptr<wl_event_queue, decltype(&wl_event_queue_destroy)> m_queue;
    wl_registry *m_registry = nullptr;
    wl_seat *m_seat = nullptr;
    wl_keyboard *m_keyboard = nullptr;
    uint32_t m_capabilities = 0;
    std::string m_keymap;
};

} // namespace

std::string compositorKeymap(wl_display *display)
{
    return SeatReader(display).read();
}

} // namespace favrin::host
