#include "host/window/windowplace.h"

#include "host/session/panelcolor.h"
#include "host/window/remoteviewwindow.h"

#include <QScreen>

#include <cmath>

namespace favrin::host {

WindowPlace::WindowPlace(RemoteViewWindow &window) : m_window(&window)
{
    connect(&window, &QObject::destroyed, this, &WindowPlace::wasLost);
    connect(&window, &QWindow::widthChanged, this, &WindowPlace::changed);
    connect(&window, &QWindow::heightChanged, this, &WindowPlace::changed);
    connect(&window, &QWindow::screenChanged, this, &WindowPlace::changed);
}

QWindow *WindowPlace::window() const
{
    return m_window;
}

QSizeF WindowPlace::surroundingSize() const
{
    return m_window ? QSizeF(m_window->size()) : QSizeF(0, 0);
}

QRectF WindowPlace::rectangle() const
{
    return {QPointF(), surroundingSize()};
}

void WindowPlace::setSession(RemoteViewSession *session)
{
    if (m_window)
        m_window->setSession(session);
}

void WindowPlace::setPreferredContentSize(QSizeF size)
{
    // Once it is on the screen its size is the user's.
    if (!m_window || size.isEmpty() || m_window->isVisible())
        return;
    // Whole points, of which nothing is cut off.
    const QSize whole(static_cast<int>(std::ceil(size.width())), static_cast<int>(std::ceil(size.height())));
    const QScreen *screen = m_window->screen();
    m_window->resize(screen ? whole.boundedTo(screen->availableSize()) : whole);
}

void WindowPlace::setAppearance(bool dark)
{
    if (m_window)
        m_window->setBackground(panelColor(dark));
}

} // namespace favrin::host
