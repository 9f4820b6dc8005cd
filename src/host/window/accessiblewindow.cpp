#include "host/window/accessiblewindow.h"

#include "host/window/remoteviewwindow.h"

#include <QGuiApplication>

namespace favrin::host {

namespace {

QAccessibleInterface *makeInterface(const QString &, QObject *object)
{
    return qobject_cast<RemoteViewWindow *>(object) ? new AccessibleWindow(object) : nullptr;
}

} // namespace

AccessibleWindow::AccessibleWindow(QObject *window) : QAccessibleObject(window) {}

void AccessibleWindow::install()
{
    static const bool once = [] {
        QAccessible::installFactory(makeInterface);
        return true;
    }();
    Q_UNUSED(once)
}

QAccessible::Role AccessibleWindow::role() const
{
    return QAccessible::Window;
}

QAccessible::State AccessibleWindow::state() const
{
    QAccessible::State state;
    state.active = window()->isActive();
    state.focusable = true;
    state.focused = state.active;
    return state;
}

QString AccessibleWindow::text(QAccessible::Text kind) const
{
    return kind == QAccessible::Name ? window()->title() : QString();
}

QRect AccessibleWindow::rect() const
{
    return window()->geometry();
}

QWindow *AccessibleWindow::window() const
{
    return static_cast<QWindow *>(object());
}

QAccessibleInterface *AccessibleWindow::parent() const
{
    return QAccessible::queryAccessibleInterface(qGuiApp);
}

} // namespace favrin::host
