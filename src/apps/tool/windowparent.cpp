#include "apps/tool/windowparent.h"

#include "apps/tool/waylandparent.h"

#include <QGuiApplication>
#include <QWindow>

namespace favrin::tool {

namespace {

QString attachToX11(QWindow &window, X11Window parent)
{
    if (QGuiApplication::platformName() != u"xcb")
        return QStringLiteral("the parent is a window of X11, the picker's own is not");
    QWindow *foreign = QWindow::fromWinId(parent.identifier);
    if (!foreign)
        return QStringLiteral("the parent window is not there");
    foreign->setParent(nullptr);
    QObject::connect(&window, &QObject::destroyed, foreign, &QObject::deleteLater);
    window.setTransientParent(foreign);
    return {};
}

} // namespace

QString attach(QWindow &window, const ParentHandle &parent)
{
    if (const auto *x11 = std::get_if<X11Window>(&parent))
        return attachToX11(window, *x11);
    if (const auto *wayland = std::get_if<WaylandHandle>(&parent))
        return attachToWayland(window, wayland->text);
    return {};
}

} // namespace favrin::tool
