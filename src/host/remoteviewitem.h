#pragma once

#include "host/session/remoteviewinput.h"

#include <QPointer>
#include <QQuickItem>
#include <QRegion>

namespace favrin::host {

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
    RemoteViewSession *session() const { return m_input.session(); }

    QVariant inputMethodQuery(Qt::InputMethodQuery query) const override;

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
    double pixelRatio() const;
    void followWindow(QQuickWindow *window);
    void surfaceDidChange(const QRegion &damage, bool resized);
    void hastenFrame();
    void frameWasSwapped();
    void focusDidLeave(remote::FocusDirection direction);

    RemoteViewInput m_input;
    QPointer<QQuickWindow> m_window;
    QRegion m_damage;
    bool m_imageIsNew = false;
    /** A frame of the service has been put into the scene and the window has not shown it yet. */
    bool m_waitingForSwap = false;
    bool m_frameIsHastened = false;
};

} // namespace favrin::host
