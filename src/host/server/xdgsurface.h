#pragma once

#include "host/server/resource.h"
#include "host/server/surface.h"

namespace favrin::host::server {

class XdgShell;

/**
 * xdg_surface: the conversation about size before and while a surface is shown.
 *
 * One configure is open at a time; while it waits for its answer, newer sizes replace each other.
 */
class XdgSurface : public Resource, private SurfaceObserver
{
public:
    XdgSurface(wl_resource *handle, XdgShell &shell, Surface &surface);
    ~XdgSurface() override;

    /** Null once the wl_surface is gone. */
    Surface *surface() const { return m_surface.as<Surface>(); }
    /** Tells the size and state that the shell wants by now. */
    void reconfigure();
    void toplevelWillGo();

private:
    static const void *requests();
    bool surfaceMayCommit(bool withBuffer) override;
    void surfaceDidCommit() override;
    void surfaceWillGo() override;

    void makeToplevel(wl_client *client, std::uint32_t id);
    void makePopup(wl_client *client, std::uint32_t id);
    bool takeRole(SurfaceRole role);
    void acknowledge(std::uint32_t serial);
    void sendConfigure();
    void restart();

    enum class Stage {
        /** Nothing was committed yet. */
        New,
        /** The first configure is on its way. */
        Configuring,
        /** It was acknowledged: content may come. */
        Configured,
    };

    XdgShell &m_shell;
    WeakResource m_surface;
    WeakResource m_roleObject;
    bool m_isPicker = false;
    bool m_wasMapped = false;
    Stage m_stage = Stage::New;
    /** Serial of the configure that waits for its acknowledgement, or 0. */
    std::uint32_t m_openConfigure = 0;
    /** The one that was open when the surface was unmapped; its acknowledgement means nothing any more. */
    std::uint32_t m_retiredConfigure = 0;
    bool m_configureAgain = false;
};

} // namespace favrin::host::server
