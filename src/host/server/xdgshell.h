#pragma once

#include "host/server/resource.h"

#include <functional>

namespace favrin::host::server {

class Connection;
class Screens;
class Surface;
class XdgSurface;

/** xdg_wm_base: gives surfaces their roles, knows the one toplevel that is the picker, and asks whether it is alive. */
class XdgShell
{
public:
    XdgShell(Connection &connection, Screens &screens);

    /** Points. */
    void configure(int width, int height);
    /** The picker has the keyboard focus. */
    void setActivated(bool activated);
    void ping();

    /** The picker's surface while it has content, else null. */
    Surface *mappedSurface() const { return m_mapped; }
    /** Called when mappedSurface() has changed. */
    void onMappedSurfaceChanged(std::function<void()> action) { m_mappedChanged = std::move(action); }

    Connection &connection() { return m_connection; }
    /** What a toplevel is to be. */
    int width() const { return m_width; }
    int height() const { return m_height; }
    bool isActivated() const { return m_activated; }

    /** The first toplevel is the picker; false for any other while there is one. */
    bool adopt(XdgSurface &toplevel);
    void toplevelDidChange(XdgSurface &toplevel, Surface *mapped);
    void toplevelWillGo(XdgSurface &toplevel);

private:
    static const void *requests();
    void bind(wl_client *client, int version, std::uint32_t id);
    void makeXdgSurface(wl_client *client, wl_resource *shell, std::uint32_t id, wl_resource *surface);
    void pong(std::uint32_t serial);
    void setMapped(Surface *surface);

    Connection &m_connection;
    Screens &m_screens;
    ResourceList m_resources;
    XdgSurface *m_toplevel = nullptr;
    Surface *m_mapped = nullptr;
    std::function<void()> m_mappedChanged;
    int m_width = 0;
    int m_height = 0;
    bool m_activated = false;
    /** Serial of the ping that waits for its pong, or 0. */
    std::uint32_t m_openPing = 0;
    bool m_responsive = true;
};

} // namespace favrin::host::server
