#include "host/remoteviewitem.h"

#include "host/clipboardbridge.h"
#include "host/inputmethodanswer.h"
#include "host/keyboardforwarder.h"
#include "host/pointerforwarder.h"
#include "host/remotesurfacenode.h"
#include "host/remoteviewsession.h"

#include <QGuiApplication>
#include <QInputMethod>
#include <QQuickWindow>
#include <QSGRendererInterface>

#include <cmath>
#include <utility>

namespace favrin::host {

RemoteViewItem::RemoteViewItem(QQuickItem *parent)
    : QQuickItem(parent)
    , m_pointer(std::make_unique<PointerForwarder>())
    , m_keyboard(std::make_unique<KeyboardForwarder>())
    , m_clipboard(std::make_unique<ClipboardBridge>())
{
    setFlag(ItemHasContents);
    setAcceptedMouseButtons(Qt::AllButtons);
    setAcceptHoverEvents(true);
    setAcceptTouchEvents(true);
    setActiveFocusOnTab(true);
    // The picker's gestures are its own: nothing around it may take them over.
    setKeepMouseGrab(true);
    setKeepTouchGrab(true);
    // The base class entered the scene before this class could hear of it.
    followWindow(window());
}

RemoteViewItem::~RemoteViewItem()
{
    followWindow(nullptr);
}

void RemoteViewItem::setSession(RemoteViewSession *session)
{
    if (session == m_session)
        return;
    if (m_session) {
        m_session->disconnect(this);
        m_session->surface().disconnect(this);
    }
    m_session = session;
    m_pointer->setSession(session);
    m_keyboard->setSession(session);
    m_clipboard->setSession(session);
    m_damage = {};
    m_imageIsNew = true;
    m_waitingForSwap = false;
    if (session) {
        connect(&session->surface(), &RemoteSurface::changed, this, [this](const QRegion &damage, bool resized) {
            m_imageIsNew |= resized;
            surfaceDidChange(damage);
        });
        connect(session, &RemoteViewSession::frameArrived, this, [this] { m_pointer->serviceDidDraw(); });
        connect(session, &RemoteViewSession::textInputDidChange, this, &RemoteViewItem::textInputDidChange);
        connect(session, &RemoteViewSession::focusDidLeave, this, &RemoteViewItem::focusDidLeave);
        configureSurface();
        if (hasActiveFocus()) {
            m_keyboard->focusIn();
            m_clipboard->setActive(true);
        }
    }
    update();
}

void RemoteViewItem::configureSurface()
{
    if (!m_session || m_session->hasEnded() || width() < 1 || height() < 1)
        return;
    const double ratio = window() ? window()->effectiveDevicePixelRatio() : 1.0;
    // Whole numbers only: a fractional scale is drawn larger and shown smaller.
    m_session->server().configure(static_cast<int>(std::lround(width())), static_cast<int>(std::lround(height())),
                                  static_cast<int>(std::ceil(ratio - 0.01)));
    m_session->flush();
}

void RemoteViewItem::surfaceDidChange(const QRegion &damage)
{
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
    if (!m_session || m_session->surface().isEmpty()) {
        delete node;
        return nullptr;
    }
    const bool isNew = !node;
    if (isNew)
        node = new RemoteSurfaceNode(*window());
    const auto &surface = m_session->surface();
    // The picture keeps its own size until the service has drawn the new one: stretched glyphs would flash.
    const QRectF target(QPointF(), QSizeF(surface.size()) / surface.scale());
    node->update(surface, target, std::exchange(m_damage, {}), std::exchange(m_imageIsNew, false) || isNew);
    m_waitingForSwap = true;
    return node;
}

void RemoteViewItem::frameWasSwapped()
{
    m_frameIsHastened = false;
    if (!std::exchange(m_waitingForSwap, false) || !m_session || m_session->hasEnded())
        return;
    m_session->server().frameWasShown(m_session->now());
    m_session->flush();
    Q_EMIT surfaceWasShown();
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
        configureSurface();
}

void RemoteViewItem::itemChange(ItemChange change, const ItemChangeData &value)
{
    QQuickItem::itemChange(change, value);
    if (change == ItemSceneChange)
        followWindow(value.window);
    if (change == ItemVisibleHasChanged && value.boolValue)
        update();
    if (change == ItemSceneChange || change == ItemDevicePixelRatioHasChanged)
        configureSurface();
}

void RemoteViewItem::mousePressEvent(QMouseEvent *event)
{
    forceActiveFocus(Qt::MouseFocusReason);
    m_pointer->press(*event);
}

void RemoteViewItem::mouseMoveEvent(QMouseEvent *event)
{
    m_pointer->move(*event);
}

void RemoteViewItem::mouseReleaseEvent(QMouseEvent *event)
{
    m_pointer->release(*event);
    if (event->buttons() == Qt::NoButton && !contains(event->position()))
        m_pointer->leave();
}

void RemoteViewItem::mouseUngrabEvent()
{
    m_pointer->cancelPress();
}

void RemoteViewItem::hoverEnterEvent(QHoverEvent *event)
{
    m_pointer->hover(event->position());
}

void RemoteViewItem::hoverMoveEvent(QHoverEvent *event)
{
    m_pointer->hover(event->position());
}

void RemoteViewItem::hoverLeaveEvent(QHoverEvent *)
{
    m_pointer->leave();
}

void RemoteViewItem::wheelEvent(QWheelEvent *event)
{
    m_pointer->wheel(*event);
}

void RemoteViewItem::touchEvent(QTouchEvent *event)
{
    if (event->type() == QEvent::TouchBegin)
        forceActiveFocus(Qt::MouseFocusReason);
    m_pointer->touch(*event);
    event->accept();
}

void RemoteViewItem::touchUngrabEvent()
{
    m_pointer->cancelTouch();
}

void RemoteViewItem::keyPressEvent(QKeyEvent *event)
{
    event->setAccepted(m_keyboard->key(*event, true));
}

void RemoteViewItem::keyReleaseEvent(QKeyEvent *event)
{
    event->setAccepted(m_keyboard->key(*event, false));
}

bool RemoteViewItem::event(QEvent *event)
{
    // While the user types into the picker the host's single-key shortcuts stay quiet.
    if (event->type() == QEvent::ShortcutOverride && m_session && m_session->textInput().enabled) {
        event->accept();
        return true;
    }
    return QQuickItem::event(event);
}

void RemoteViewItem::inputMethodEvent(QInputMethodEvent *event)
{
    m_keyboard->text(*event);
    event->accept();
}

QVariant RemoteViewItem::inputMethodQuery(Qt::InputMethodQuery query) const
{
    if (!m_session)
        return QQuickItem::inputMethodQuery(query);
    return inputMethodAnswer(m_session->textInput(), query);
}

void RemoteViewItem::textInputDidChange()
{
    const auto &state = m_session->textInput();
    const bool toggled = flags().testFlag(ItemAcceptsInputMethod) != state.enabled;
    setFlag(ItemAcceptsInputMethod, state.enabled);
    const bool forgotten = std::exchange(m_inputMethodResets, state.resets) != state.resets;
    if (!hasActiveFocus())
        return;
    if (toggled && state.enabled)
        m_clipboard->offer();
    auto *inputMethod = QGuiApplication::inputMethod();
    if (forgotten)
        inputMethod->reset();
    inputMethod->update(toggled ? Qt::ImQueryAll : Qt::ImQueryInput | Qt::ImHints);
    const bool wantsPanel = state.enabled && state.wantsInputPanel;
    if (std::exchange(m_inputPanelWanted, wantsPanel) != wantsPanel)
        inputMethod->setVisible(wantsPanel);
}

void RemoteViewItem::focusInEvent(QFocusEvent *event)
{
    QQuickItem::focusInEvent(event);
    m_keyboard->focusIn();
    m_clipboard->setActive(true);
    if (!m_session || (event->reason() != Qt::TabFocusReason && event->reason() != Qt::BacktabFocusReason))
        return;
    m_session->server().sendFocusWillEnter(event->reason() == Qt::TabFocusReason ? remote::FocusDirection::Forward
                                                                                 : remote::FocusDirection::Backward);
    m_session->flush();
}

void RemoteViewItem::focusDidLeave(remote::FocusDirection direction)
{
    if (!hasActiveFocus())
        return;
    const bool forward = direction == remote::FocusDirection::Forward;
    QQuickItem *next = nextItemInFocusChain(forward);
    if (next && next != this) {
        next->forceActiveFocus(forward ? Qt::TabFocusReason : Qt::BacktabFocusReason);
        return;
    }
    // There is nothing else: the focus goes round in the picker.
    m_session->server().sendFocusWillEnter(direction);
    m_session->flush();
}

void RemoteViewItem::focusOutEvent(QFocusEvent *event)
{
    QQuickItem::focusOutEvent(event);
    m_clipboard->setActive(false);
    m_keyboard->focusOut();
}

} // namespace favrin::host
