#include "host/hostkeymap.h"

#include <QGuiApplication>

#include <cstdlib>
#include <memory>

#include <sys/mman.h>
#include <unistd.h>

#include <wayland-client.h>
#include <xcb/xcb.h>
#include <xkbcommon/xkbcommon-x11.h>

#if QT_VERSION < QT_VERSION_CHECK(6, 5, 0)
#include <qpa/qplatformnativeinterface.h>
#endif

namespace favrin::host {

namespace {

std::string keymapOfXServer()
{
    const auto *application = qGuiApp->nativeInterface<QNativeInterface::QX11Application>();
    xcb_connection_t *connection = application ? application->connection() : nullptr;
    if (!connection)
        return {};
    const std::unique_ptr<xkb_context, decltype(&xkb_context_unref)> context(xkb_context_new(XKB_CONTEXT_NO_FLAGS),
                                                                             xkb_context_unref);
    const int device = xkb_x11_get_core_keyboard_device_id(connection);
    if (!context || device < 0)
        return {};
    const std::unique_ptr<xkb_keymap, decltype(&xkb_keymap_unref)> keymap(
        xkb_x11_keymap_new_from_device(context.get(), connection, device, XKB_KEYMAP_COMPILE_NO_FLAGS),
        xkb_keymap_unref);
    if (!keymap)
        return {};
    const std::unique_ptr<char, decltype(&std::free)> text(
        xkb_keymap_get_as_string(keymap.get(), XKB_KEYMAP_FORMAT_TEXT_V1), std::free);
    return text ? std::string(text.get()) : std::string();
}

struct CompositorKeymap
{
    std::string text;

    static void keymap(void *data, wl_keyboard *, uint32_t format, int32_t descriptor, uint32_t size)
    {
        if (format == WL_KEYBOARD_KEYMAP_FORMAT_XKB_V1 && size > 0) {
            void *memory = mmap(nullptr, size, PROT_READ, MAP_PRIVATE, descriptor, 0);
            if (memory != MAP_FAILED) {
                static_cast<CompositorKeymap *>(data)->text.assign(static_cast<const char *>(memory), size - 1);
                munmap(memory, size);
            }
        }
        close(descriptor);
    }
    static void enter(void *, wl_keyboard *, uint32_t, wl_surface *, wl_array *) {}
    static void leave(void *, wl_keyboard *, uint32_t, wl_surface *) {}
    static void key(void *, wl_keyboard *, uint32_t, uint32_t, uint32_t, uint32_t) {}
    static void modifiers(void *, wl_keyboard *, uint32_t, uint32_t, uint32_t, uint32_t, uint32_t) {}
    static void repeatInfo(void *, wl_keyboard *, int32_t, int32_t) {}
};

struct WaylandHandles
{
    wl_display *display = nullptr;
    wl_seat *seat = nullptr;
};

WaylandHandles waylandHandles()
{
#if QT_VERSION < QT_VERSION_CHECK(6, 5, 0)
    auto *native = QGuiApplication::platformNativeInterface();
    if (!native || !QGuiApplication::platformName().startsWith(u"wayland"))
        return {};
    return {static_cast<wl_display *>(native->nativeResourceForIntegration("wl_display")),
            static_cast<wl_seat *>(native->nativeResourceForIntegration("wl_seat"))};
#else
    const auto *application = qGuiApp->nativeInterface<QNativeInterface::QWaylandApplication>();
    return application ? WaylandHandles{application->display(), application->seat()} : WaylandHandles{};
#endif
}

/** Asks on a queue of its own, so that nothing of Qt's is dispatched meanwhile; one round trip to the compositor. */
std::string keymapOfCompositor()
{
    const auto [display, seat] = waylandHandles();
    if (!display || !seat)
        return {};
    const std::unique_ptr<wl_event_queue, decltype(&wl_event_queue_destroy)> queue(wl_display_create_queue(display),
                                                                                   wl_event_queue_destroy);
    auto *wrapper = static_cast<wl_seat *>(wl_proxy_create_wrapper(seat));
    if (!queue || !wrapper)
        return {};
    wl_proxy_set_queue(reinterpret_cast<wl_proxy *>(wrapper), queue.get());
    wl_keyboard *keyboard = wl_seat_get_keyboard(wrapper);
    wl_proxy_wrapper_destroy(wrapper);
    static constexpr wl_keyboard_listener listener = {
        .keymap = CompositorKeymap::keymap,
        .enter = CompositorKeymap::enter,
        .leave = CompositorKeymap::leave,
        .key = CompositorKeymap::key,
        .modifiers = CompositorKeymap::modifiers,
        .repeat_info = CompositorKeymap::repeatInfo,
    };
    CompositorKeymap keymap;
    wl_keyboard_add_listener(keyboard, &listener, &keymap);
    wl_display_roundtrip_queue(display, queue.get());
    wl_keyboard_destroy(keyboard);
    return keymap.text;
}

} // namespace

std::string hostKeymap()
{
    static const std::string keymap = [] {
        auto text = keymapOfXServer();
        return text.empty() ? keymapOfCompositor() : text;
    }();
    return keymap;
}

} // namespace favrin::host
