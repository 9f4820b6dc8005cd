#pragma once

#include "host/server/resource.h"

namespace favrin::host::server {

class XdgSurface;

/** xdg_toplevel: what a desktop would do with a window is not done here; the wishes are taken and not followed. */
class XdgToplevel : public Resource
{
public:
    XdgToplevel(wl_resource *handle, XdgSurface &surface);
    ~XdgToplevel() override;

private:
    static const void *requests();

    WeakResource m_surface;
};

/** xdg_popup: nothing may lie over the host's window, so that a popup is dismissed as soon as it is made. */
class XdgPopup : public Resource
{
public:
    explicit XdgPopup(wl_resource *handle);

private:
    static const void *requests();
};

} // namespace favrin::host::server
