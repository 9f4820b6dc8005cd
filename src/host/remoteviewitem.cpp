#include "host/remoteviewitem.h"

#include "host/remotesurfacenode.h"
#include "host/session/keyboardforwarder.h"
#include "host/session/pointerforwarder.h"

#include <QGuiApplication>
#include <QQuickWindow>
#include <QSGRendererInterface>

#include <utility>

namespace favrin::host {

RemoteViewItem::RemoteViewItem(QQuickItem *parent) : QQuickItem(parent)
{
    setFlag(ItemHasContents);
    setAcceptedMouseButtons(Qt::AllButtons);
    setAcceptHoverEvents(true);
    setAcceptTouchEvents(true);
    setActiveFocusOnTab(true);
    // The picker's gestures are its own: nothing around it may take them over.
    setKeepMouseGrab(true);
    setKeepTouchGrab(true);
    connect(&m_input, &RemoteViewInput::surfaceDidChange, this, &RemoteViewItem::surfaceDidChange);
    connect(&m_input, &RemoteViewInput::textWantedDidChange, this,
            [this](bool wanted) { setFlag(ItemAcceptsInputMethod, wanted); });
    connect(&m_input, &RemoteViewInput::focusDidLeave, this, &RemoteViewItem::focusDidLeave);
    // The base class entered the scene before this class could hear of it.
    followWindow(window());
}

RemoteViewItem::~RemoteViewItem()
{
    followWindow(nullptr);
}

void RemoteViewItem::setSession(RemoteViewSession *session)
{
    if (session == m_input.session())
        return;
    m_damage = {};
    m_imageIsNew = true;
    m_waitingForSwap = false;
    m_input.setSession(session, size(), pixelRatio());
    update();
}

double RemoteViewItem::pixelRatio() const
{
    return window() ? window()->effectiveDevicePixelRatio() : 1.0;
}

void RemoteViewItem::surfaceDidChange(const QRegion &damage, bool resized)
{
    m_imageIsNew |= resized;
    m_damage += damage;
    // The picker goes on drawing when its frame was shown; what the app hides is not to be drawn by either.
    if (!isVisible())
        return;
    update();
    hastenFrame();
}

void RemoteViewItem::hastenFrame()
{
    // X11 and the platforms without a display put off each frame by an idle timer of 5 ms, which a drag would feel. A
    // frame that is asked for by its event is drawn in this turn of the event loop; the timer then finds nothing to do.
    // Wayland paces frames itself, and with a GPU the render loop waits for the display.
    const bool software = window() && window()->rendererInterface()->graphicsApi() == QSGRendererInterface::Software;
    if (!software || !window()->isExposed() || QGuiApplication::platformName().startsWith(u"wayland"))
        return;
    if (!std::exchange(m_frameIsHastened, true))
        QCoreApplication::postEvent(window(), new QEvent(QEvent::UpdateRequest));
}

QSGNode *RemoteViewItem::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    auto *node = static_cast<RemoteSurfaceNode *>(oldNode);
    if (!session() || session()->surface().isEmpty()) {
        delete node;
        return nullptr;
    }
    const bool isNew = !node;
    if (isNew)
        node = new RemoteSurfaceNode(*window());
    const auto &surface = session()->surface();
    // The picture keeps its own size until the service has drawn the new one: stretched glyphs would flash.
    const QRectF target(QPointF(), QSizeF(surface.size()) / surface.scale());
    node->update(surface, target, std::exchange(m_damage, {}), std::exchange(m_imageIsNew, false) || isNew);
    m_waitingForSwap = true;
    return node;
}

void RemoteViewItem::frameWasSwapped()
{
    m_frameIsHastened = false;
    if (std::exchange(m_waitingForSwap, false))
        m_input.frameWasShown();
}

void RemoteViewItem::followWindow(QQuickWindow *window)
{
    if (m_window)
        m_window->disconnect(this);
    m_window = window;
    if (window)
        connect(window, &QQuickWindow::frameSwapped, this, &RemoteViewItem::frameWasSwapped);
}

void RemoteViewItem::geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChange(newGeometry, oldGeometry);
    if (newGeometry.size() != oldGeometry.size())
        m_input.configureSurface(size(), pixelRatio());
}

void RemoteViewItem::itemChange(ItemChange change, const ItemChangeData &value)
{
    QQuickItem::itemChange(change, value);
    if (change == ItemSceneChange)
        followWindow(value.window);
    if (change == ItemVisibleHasChanged && value.boolValue)
        update();
    if (change == ItemSceneChange || change == ItemDevicePixelRatioHasChanged)
        m_input.configureSurface(size(), pixelRatio());
}

void RemoteViewItem::mousePressEvent(QMouseEvent *event)
{
    forceActiveFocus(Qt::MouseFocusReason);
    m_input.pointer().press(*event);
}

void RemoteViewItem::mouseMoveEvent(QMouseEvent *event)
{
    m_input.pointer().move(*event);
}

void RemoteViewItem::mouseReleaseEvent(QMouseEvent *event)
{
    m_input.pointer().release(*event);
    if (event->buttons() == Qt::NoButton && !contains(event->position()))
        m_input.pointer().leave();
}

void RemoteViewItem::mouseUngrabEvent()
{
    m_input.pointer().cancelPress();
}

void RemoteViewItem::hoverEnterEvent(QHoverEvent *event)
{
    m_input.pointer().hover(event->position());
}

void RemoteViewItem::hoverMoveEvent(QHoverEvent *event)
{
    m_input.pointer().hover(event->position());
}

void RemoteViewItem::hoverLeaveEvent(QHoverEvent *)
{
    m_input.pointer().leave();
}

void RemoteViewItem::wheelEvent(QWheelEvent *event)
{
    m_input.pointer().wheel(*event);
}

void RemoteViewItem::touchEvent(QTouchEvent *event)
{
    if (event->type() == QEvent::TouchBegin)
        forceActiveFocus(Qt::MouseFocusReason);
    m_input.pointer().touch(*event);
    event->accept();
}

void RemoteViewItem::touchUngrabEvent()
{
    m_input.pointer().cancelTouch();
}

void RemoteViewItem::keyPressEvent(QKeyEvent *event)
{
    event->setAccepted(m_input.keyboard().key(*event, true));
}

void RemoteViewItem::keyReleaseEvent(QKeyEvent *event)
{
    event->setAccepted(m_input.keyboard().key(*event, false));
}

bool RemoteViewItem::event(QEvent *event)
{
    // While the user types into the picker the host's single-key shortcuts stay quiet.
    if (event->type() == QEvent::ShortcutOverride && m_input.isTextWanted()) {
        event->accept();
        return true;
    }
    return QQuickItem::event(event);
}

void RemoteViewItem::inputMethodEvent(QInputMethodEvent *event)
{
    m_input.keyboard().text(*event);
    event->accept();
}

QVariant RemoteViewItem::inputMethodQuery(Qt::InputMethodQuery query) const
{
    return session() ? m_input.answer(query) : QQuickItem::inputMethodQuery(query);
}

void RemoteViewItem::focusInEvent(QFocusEvent *event)
{
    QQuickItem::focusInEvent(event);
    m_input.focusIn(event->reason());
}

void RemoteViewItem::focusDidLeave(remote::FocusDirection direction)
{
    const bool forward = direction == remote::FocusDirection::Forward;
    QQuickItem *next = nextItemInFocusChain(forward);
    if (next && next != this)
        next->forceActiveFocus(forward ? Qt::TabFocusReason : Qt::BacktabFocusReason);
    else
        // There is nothing else: the focus goes round in the picker.
        m_input.enterFocus(direction);
}

void RemoteViewItem::focusOutEvent(QFocusEvent *event)
{
    QQuickItem::focusOutEvent(event);
    m_input.focusOut();
}

} // namespace favrin::host
