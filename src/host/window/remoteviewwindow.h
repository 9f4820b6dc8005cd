#pragma once

#include "host/session/remoteviewinput.h"

#include <QBackingStore>
#include <QColor>
#include <QWindow>

class QInputMethodQueryEvent;

namespace favrin::host {

/**
 * A window that a picker fills: shows the surface of its process and passes on what the user does with it. The surface
 * follows the window's size and scale. GUI thread.
 */
class RemoteViewWindow : public QWindow
{
    Q_OBJECT

public:
    RemoteViewWindow();

    /** Shows another session, or nothing. */
    void setSession(RemoteViewSession *session);
    /** What shows where the picker draws nothing. */
    void setBackground(const QColor &color);

    QAccessibleInterface *accessibleRoot() const override;

protected:
    bool event(QEvent *event) override;
    void exposeEvent(QExposeEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void touchEvent(QTouchEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void keyReleaseEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;

private:
    void surfaceDidChange(const QRegion &damage);
    void scheduleFrame();
    /** Draws what is damaged and shows it. */
    void drawFrame();
    void paint(QPainter &painter, const QRegion &region) const;
    QRect inPoints(const QRect &pixels) const;
    void answerInputMethod(QInputMethodQueryEvent &event) const;

    RemoteViewInput m_input;
    QBackingStore m_store;
    QColor m_background = Qt::white;
    /** Points. */
    QRegion m_damage;
    /** The service has drawn something that the window has not shown yet. */
    bool m_surfaceIsNew = false;
    bool m_frameIsScheduled = false;
};

} // namespace favrin::host
