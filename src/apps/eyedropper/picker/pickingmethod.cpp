#include "apps/eyedropper/picker/pickingmethod.h"

#include "apps/eyedropper/picker/screenpicture.h"

#include <memory>

#include <xcb/xcb.h>

namespace favrin::eyedropper {

namespace {

bool xScreenCanBeRead()
{
    if (qEnvironmentVariableIsEmpty("DISPLAY"))
        return false;
    const std::unique_ptr<xcb_connection_t, decltype(&xcb_disconnect)> connection(xcb_connect(nullptr, nullptr),
                                                                                  &xcb_disconnect);
    return xcb_connection_has_error(connection.get()) == 0 && screenCanBeRead(connection.get());
}

} // namespace

Session Session::current()
{
    return {.waylandDisplay = qEnvironmentVariable("WAYLAND_DISPLAY"),
            .sessionType = qEnvironmentVariable("XDG_SESSION_TYPE"),
            .hasX11 = xScreenCanBeRead()};
}

PickingMethod pickingMethod(const Session &session)
{
    const bool isWayland = !session.waylandDisplay.isEmpty() || session.sessionType == u"wayland";
    return session.hasX11 && !isWayland ? PickingMethod::Loupe : PickingMethod::Portal;
}

} // namespace favrin::eyedropper
