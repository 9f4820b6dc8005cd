#pragma once

#include <QString>

namespace favrin::eyedropper {

/** Who samples the screen: this program, through a loupe over it, or the desktop. */
enum class PickingMethod { Loupe, Portal };

/** What this process knows of the session it runs in. */
struct Session
{
    QString waylandDisplay;
    QString sessionType;
    /** An X server answers, and its screen can be read. */
    bool hasX11 = false;

    /** Asks the environment, and looks at the X server that it names. */
    static Session current();
};

/**
 * A loupe sees the screen on X11 only. In a Wayland session the X server shows nothing but the X11 windows, so there,
 * and without any display, it is the desktop's task.
 */
PickingMethod pickingMethod(const Session &session);

} // namespace favrin::eyedropper
