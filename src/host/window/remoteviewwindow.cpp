#include "host/window/remoteviewwindow.h"

#include "host/session/keyboardforwarder.h"
#include "host/session/pointerforwarder.h"
#include "host/window/accessiblewindow.h"

#include <QGuiApplication>
#include <QInputMethodQueryEvent>
#include <QPainter>

#include <utility>

namespace favrin::host {

RemoteViewWindow::RemoteViewWindow() : m_store(this)
{
    setSurfaceType(RasterSurface);
    AccessibleWindow::install();
    connect(&m_input, &RemoteViewInput::surfaceDidChange, this, &RemoteViewWindow::surfaceDidChange);
    // There is nothing else in the window: the focus goes round in the picker.
    connect(&m_input, &RemoteViewInput::focusDidLeave, &m_input, &RemoteViewInput::enterFocus);
    connect(this, &QWindow::screenChanged, this, [this] { m_input.configureSurface(size(), devicePixelRatio()); });
}

void RemoteViewWindow::setSession(RemoteViewSession *session)
{
    if (session == m_input.session())
        return;
    m_surfaceIsNew = false;
    m_input.setSession(session, size(), devicePixelRatio());
    m_damage = QRect(QPoint(), size());
    scheduleFrame();
}

void RemoteViewWindow::setBackground(const QColor &color)
{
    if (std::exchange(m_background, color) == color)
        return;
    m_damage = QRect(QPoint(), size());
    scheduleFrame();
}

QAccessibleInterface *RemoteViewWindow::accessibleRoot() const
{
    return QAccessible::queryAccessibleInterface(const_cast<RemoteViewWindow *>(this));
}

QRect RemoteViewWindow::inPoints(const QRect &pixels) const
{
    const double scale = m_input.session()->surface().scale();
    const QRectF exact(QPointF(pixels.topLeft()) / scale, QSizeF(pixels.size()) / scale);
    return exact.toAlignedRect();
}

void RemoteViewWindow::surfaceDidChange(const QRegion &damage)
{
    m_surfaceIsNew = true;
    for (const QRect &rectangle : damage)
        m_damage += inPoints(rectangle);
    scheduleFrame();
}

void RemoteViewWindow::scheduleFrame()
{
    if (!isExposed() || std::exchange(m_frameIsScheduled, true))
        return;
    // Wayland paces frames itself. Elsewhere a frame that is asked for waits for an idle timer of 5 ms, which a drag
    // would feel; one that is asked for by its event is drawn in this turn of the event loop.
    if (QGuiApplication::platformName().startsWith(u"wayland"))
        requestUpdate();
    else
        QCoreApplication::postEvent(this, new QEvent(QEvent::UpdateRequest));
}

void RemoteViewWindow::drawFrame()
{
    m_frameIsScheduled = false;
    if (!isExposed() || size().isEmpty())
        return;
    if (m_store.size() != size()) {
        m_store.resize(size());
        m_damage = QRect(QPoint(), size());
    }
    const QRegion region = std::exchange(m_damage, {}) & QRect(QPoint(), size());
    if (!region.isEmpty()) {
        m_store.beginPaint(region);
        {
            QPainter painter(m_store.paintDevice());
            paint(painter, region);
        }
        m_store.endPaint();
        m_store.flush(region);
    }
    if (std::exchange(m_surfaceIsNew, false))
        m_input.frameWasShown();
}

void RemoteViewWindow::paint(QPainter &painter, const QRegion &region) const
{
    painter.setClipRegion(region);
    painter.fillRect(QRect(QPoint(), size()), m_background);
    if (!m_input.session() || m_input.session()->surface().isEmpty())
        return;
    const auto &surface = m_input.session()->surface();
    // The picture keeps its own size until the service has drawn the new one: stretched glyphs would flash.
    const QRectF target(QPointF(), QSizeF(surface.size()) / surface.scale());
    painter.setRenderHint(QPainter::SmoothPixmapTransform, !qFuzzyCompare(devicePixelRatio(), surface.scale()));
    painter.drawImage(target, surface.image());
}

bool RemoteViewWindow::event(QEvent *event)
{
    switch (event->type()) {
    case QEvent::UpdateRequest:
        drawFrame();
        return true;
    case QEvent::Leave:
        m_input.pointer().leave();
        break;
    case QEvent::InputMethodQuery:
        answerInputMethod(*static_cast<QInputMethodQueryEvent *>(event));
        return true;
    case QEvent::InputMethod:
        m_input.keyboard().text(*static_cast<QInputMethodEvent *>(event));
        event->accept();
        return true;
    default:
        break;
    }
    return QWindow::event(event);
}

void RemoteViewWindow::answerInputMethod(QInputMethodQueryEvent &event) const
{
    for (unsigned bit = 1; bit != 0; bit <<= 1) {
        const auto query = static_cast<Qt::InputMethodQuery>(bit);
        if (event.queries().testFlag(query))
            event.setValue(query, query == Qt::ImEnabled ? QVariant(m_input.isTextWanted()) : m_input.answer(query));
    }
    event.accept();
}

void RemoteViewWindow::exposeEvent(QExposeEvent *)
{
    if (!isExposed()) {
        m_frameIsScheduled = false;
        return;
    }
    m_damage = QRect(QPoint(), size());
    drawFrame();
}

void RemoteViewWindow::resizeEvent(QResizeEvent *)
{
    m_input.configureSurface(size(), devicePixelRatio());
}

void RemoteViewWindow::mousePressEvent(QMouseEvent *event)
{
    m_input.pointer().press(*event);
}

void RemoteViewWindow::mouseMoveEvent(QMouseEvent *event)
{
    if (event->buttons() == Qt::NoButton)
        m_input.pointer().hover(event->position());
    else
        m_input.pointer().move(*event);
}

void RemoteViewWindow::mouseReleaseEvent(QMouseEvent *event)
{
    m_input.pointer().release(*event);
    if (event->buttons() == Qt::NoButton && !QRectF(QPointF(), size()).contains(event->position()))
        m_input.pointer().leave();
}

void RemoteViewWindow::wheelEvent(QWheelEvent *event)
{
    m_input.pointer().wheel(*event);
}

void RemoteViewWindow::touchEvent(QTouchEvent *event)
{
    m_input.pointer().touch(*event);
    event->accept();
}

void RemoteViewWindow::keyPressEvent(QKeyEvent *event)
{
    event->setAccepted(m_input.keyboard().key(*event, true));
}

void RemoteViewWindow::keyReleaseEvent(QKeyEvent *event)
{
    event->setAccepted(m_input.keyboard().key(*event, false));
}

void RemoteViewWindow::focusInEvent(QFocusEvent *event)
{
    m_input.focusIn(event->reason());
}

void RemoteViewWindow::focusOutEvent(QFocusEvent *)
{
    m_input.focusOut();
}

} // namespace favrin::host
