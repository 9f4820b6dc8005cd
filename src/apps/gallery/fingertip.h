#pragma once

#include <QEventPoint>

class QPointingDevice;
class QWindow;

namespace favrin::gallery {

/**
 * A finger on a touch screen of its own: what it does reaches the window as the platform would report it, so that
 * delivery, grabs and gestures are the real ones. Positions are in points of the window.
 */
class Fingertip
{
public:
    explicit Fingertip(QWindow *window);

    void press(QPointF position);
    void move(QPointF position);
    void lift();
    void tap(QPointF position);

private:
    void send(QPointF position, QEventPoint::State state);

    QWindow *m_window;
    const QPointingDevice *m_screen;
    QPointF m_position;
};

} // namespace favrin::gallery
