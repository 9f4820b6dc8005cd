#pragma once

#include "host/remoteviewsession.h"

#include <QPointer>
#include <QQuickItem>
#include <QRegion>

#include <memory>

namespace favrin::host {

class ClipboardBridge;
class KeyboardForwarder;
class PointerForwarder;

/**
 * Shows the surface of a picker process and passes on what the user does with it: touch, pointer, wheel, keys, input
 * method text, focus. The surface follows the item's size and the window's scale.
 */
class RemoteViewItem : public QQuickItem
{
    Q_OBJECT

public:
    explicit RemoteViewItem(QQuickItem *parent = nullptr);
    ~RemoteViewItem() override;

    /** Shows another session, or nothing. */
    void setSession(RemoteViewSession *session);
    RemoteViewSession *session() const { return m_session; }
    /** Tells the session the size and scale there are now; afterwards it follows by itself. */
    void configureSurface();

    QVariant inputMethodQuery(Qt::InputMethodQuery query) const override;

Q_SIGNALS:
    /** The window has shown a frame that holds what the service drew last. */
    void surfaceWasShown();

protected:
    QSGNode *updatePaintNode(QSGNode *node, UpdatePaintNodeData *data) override;
    void geometryChange(const QRectF &newGeometry, const QRectF &oldGeometry) override;
    void itemChange(ItemChange change, const ItemChangeData &value) override;

    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseUngrabEvent() override;
    void hoverEnterEvent(QHoverEvent *event) override;
    void hoverMoveEvent(QHoverEvent *event) override;
    void hoverLeaveEvent(QHoverEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void touchEvent(QTouchEvent *event) override;
    void touchUngrabEvent() override;
    void keyPressEvent(QKeyEvent *event) override;
    void keyReleaseEvent(QKeyEvent *event) override;
    void inputMethodEvent(QInputMethodEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;
    bool event(QEvent *event) override;

private:
    void followWindow(QQuickWindow *window);
    void surfaceDidChange(const QRegion &damage);
    void hastenFrame();
    void frameWasSwapped();
    void textInputDidChange();
    void focusDidLeave(remote::FocusDirection direction);

    QPointer<RemoteViewSession> m_session;
    QPointer<QQuickWindow> m_window;
    std::unique_ptr<PointerForwarder> m_pointer;
    std::unique_ptr<KeyboardForwarder> m_keyboard;
    std::unique_ptr<ClipboardBridge> m_clipboard;
    QRegion m_damage;
    bool m_imageIsNew = false;
    /** A frame of the service has been put into the scene and the window has not shown it yet. */
    bool m_waitingForSwap = false;
    bool m_frameIsHastened = false;
    std::uint32_t m_inputMethodResets = 0;
    bool m_inputPanelWanted = false;
};

} // namespace favrin::host
