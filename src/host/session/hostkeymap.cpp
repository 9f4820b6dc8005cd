#include "host/session/hostkeymap.h"

#include "host/session/compositorkeymap.h"

#include <QGuiApplication>

#include <cstdlib>
#include <memory>

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

wl_display *displayOfWayland()
{
#if QT_VERSION < QT_VERSION_CHECK(6, 5, 0)
    auto *native = QGuiApplication::platformNativeInterface();
    if (!native || !QGuiApplication::platformName().startsWith(u"wayland"))
        return nullptr;
    return static_cast<wl_display *>(native->nativeResourceForIntegration("wl_display"));
#else
    const auto *application = qGuiApp->nativeInterface<QNativeInterface::QWaylandApplication>();
    return application ? application->display() : nullptr;
#endif
}

} // namespace

std::string hostKeymap()
{
    static const std::string keymap = [] {
        if (wl_display *display = displayOfWayland())
            return compositorKeymap(display);
        return keymapOfXServer();
    }();
    return keymap;
}

} // namespace favrin::host
