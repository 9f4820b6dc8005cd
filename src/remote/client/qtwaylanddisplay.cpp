#include "remote/client/remoteviewconnection.h"

#include <QGuiApplication>
#include <QtGlobal>

#if QT_VERSION < QT_VERSION_CHECK(6, 5, 0)
#include <qpa/qplatformnativeinterface.h>
#endif

namespace favrin::remote::client {

wl_display *qtWaylandDisplay()
{
#if QT_VERSION < QT_VERSION_CHECK(6, 5, 0)
    auto *native = QGuiApplication::platformNativeInterface();
    return native ? static_cast<wl_display *>(native->nativeResourceForIntegration("wl_display")) : nullptr;
#else
    auto *application = qGuiApp->nativeInterface<QNativeInterface::QWaylandApplication>();
    return application ? application->display() : nullptr;
#endif
}

} // namespace favrin::remote::client
