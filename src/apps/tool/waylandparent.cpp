#include "apps/tool/waylandparent.h"

#include <QGuiApplication>
#include <QString>
#include <QWindow>
#include <qpa/qplatformnativeinterface.h>

#include <memory>
#include <string_view>

#include <wayland-client.h>

#include <xdg-foreign-unstable-v2-client-protocol.h>

namespace favrin::tool {

namespace {

template<class Object, void (*destroy)(Object *)>
struct Destroyer
{
    void operator()(Object *object) const { destroy(object); }
};
template<class Object, void (*destroy)(Object *)>
using Owned = std::unique_ptr<Object, Destroyer<Object, destroy>>;

void takeGlobal(void *importer, wl_registry *registry, std::uint32_t name, const char *interface, std::uint32_t)
{
    if (std::string_view(interface) == zxdg_importer_v2_interface.name && !*static_cast<zxdg_importer_v2 **>(importer))
        *static_cast<zxdg_importer_v2 **>(importer) =
            static_cast<zxdg_importer_v2 *>(wl_registry_bind(registry, name, &zxdg_importer_v2_interface, 1));
}

void loseGlobal(void *, wl_registry *, std::uint32_t) {}

/** Of the compositor, or null. Its events arrive on a queue of their own, so that Qt's are left alone. */
zxdg_importer_v2 *boundImporter(wl_display *display)
{
    const Owned<wl_event_queue, wl_event_queue_destroy> queue(wl_display_create_queue(display));
    auto *wrapper = static_cast<wl_display *>(wl_proxy_create_wrapper(display));
    if (!queue || !wrapper)
        return nullptr;
    wl_proxy_set_queue(reinterpret_cast<wl_proxy *>(wrapper), queue.get());
    const Owned<wl_registry, wl_registry_destroy> registry(wl_display_get_registry(wrapper));
    wl_proxy_wrapper_destroy(wrapper);

    static constexpr wl_registry_listener listener = {takeGlobal, loseGlobal};
    zxdg_importer_v2 *importer = nullptr;
    wl_registry_add_listener(registry.get(), &listener, &importer);
    wl_display_roundtrip_queue(display, queue.get());
    if (importer)
        wl_proxy_set_queue(reinterpret_cast<wl_proxy *>(importer), nullptr);
    return importer;
}

} // namespace

QString attachToWayland(QWindow &window, const QString &handle)
{
    auto *native = QGuiApplication::platformNativeInterface();
    auto *display = native ? static_cast<wl_display *>(native->nativeResourceForIntegration("wl_display")) : nullptr;
    auto *surface = native ? static_cast<wl_surface *>(native->nativeResourceForWindow("surface", &window)) : nullptr;
    if (!display || !surface)
        return QStringLiteral("the parent is a window of Wayland, the picker's own is not");
    zxdg_importer_v2 *importer = boundImporter(display);
    if (!importer)
        return QStringLiteral("this compositor does not let windows of two programs belong together");
    // Lives as long as the connection: destroying it would take the relation away.
    auto *imported = zxdg_importer_v2_import_toplevel(importer, handle.toUtf8().constData());
    zxdg_imported_v2_set_parent_of(imported, surface);
    zxdg_importer_v2_destroy(importer);
    wl_display_flush(display);
    return {};
}

} // namespace favrin::tool
