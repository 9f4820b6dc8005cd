#pragma once

#include <QQuickItem>

namespace favrin::host {

/** Lies between the app's content and a picker, dims it a little, and takes every touch, click and key focus off it. */
class PresentationScrim : public QQuickItem
{
    Q_OBJECT

public:
    enum class Look { Dimmed, Clear };

    PresentationScrim(Look look, QQuickItem *parent);

Q_SIGNALS:
    /** Touched or clicked beside the picker. */
    void pressed();

protected:
    QSGNode *updatePaintNode(QSGNode *node, UpdatePaintNodeData *data) override;
    void mousePressEvent(QMouseEvent *event) override;
    void hoverMoveEvent(QHoverEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void touchEvent(QTouchEvent *event) override;

private:
    Look m_look;
};

} // namespace favrin::host
