#pragma once

#include "apps/eyedropper/picker/loupegesture.h"
#include "apps/eyedropper/picker/loupepainter.h"

#include <QEventPoint>
#include <QImage>
#include <QRasterWindow>

namespace favrin::eyedropper {

/**
 * Covers all displays with the picture that was taken of them, and shows the loupe over it. The picture stands still:
 * the loupe is never in it, and what moves can be sampled. Pixels of the picture, of the window and of the screen are
 * the same. GUI thread.
 */
class LoupeWindow : public QRasterWindow
{
    Q_OBJECT

public:
    /** @p displays are their places in the picture; @p scale is pixels a point. */
    LoupeWindow(QImage picture, QList<QRect> displays, double scale);
    ~LoupeWindow() override;

    QPoint crosshair() const { return m_crosshair; }
    void setCrosshair(QPoint pixel, LoupePlacement placement);
    /** Whether the user's input is heard; not at first. */
    void setListening(bool listening) { m_isListening = listening; }

Q_SIGNALS:
    void picked(const favrin::platform::Color &color);
    void cancelled();

protected:
    void paintEvent(QPaintEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void touchEvent(QTouchEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;

private:
    void followFinger(const QEventPoint &finger);
    /** Moves the crosshair by keys, and the pointer with it, which would otherwise take it back. */
    void step(QPoint way);
    void pick();
    QRect displayOfCrosshair() const;

    QImage m_picture;
    QList<QRect> m_displays;
    LoupePainter m_painter;
    LoupeGesture m_gesture;
    LoupeText m_text;
    LoupeGeometry m_geometry;
    QPoint m_crosshair;
    LoupePlacement m_placement = LoupePlacement::Around;
    bool m_isListening = false;
    bool m_isPressed = false;
};

} // namespace favrin::eyedropper
