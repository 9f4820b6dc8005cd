#pragma once

#include <QPoint>

#include <optional>

namespace favrin::eyedropper {

/**
 * What a finger does to the loupe. Put down, the loupe comes to it; put down on the loupe, it takes hold of it, so that
 * the loupe can be moved with the finger beside what it samples. Dragging moves it and leaves it where the finger is
 * lifted; a tap picks what is under the crosshair.
 */
class LoupeGesture
{
public:
    /** @p slop is how many pixels a finger may wander in a tap. */
    explicit LoupeGesture(int slop) : m_slop(slop) {}

    bool isActive() const { return m_start.has_value(); }
    /** Returns where the crosshair goes. */
    QPoint press(QPoint finger, QPoint crosshair, bool isOnLoupe);
    QPoint move(QPoint finger);
    /** Ends the gesture; true when it was a tap. */
    bool release();
    void cancel() { m_start.reset(); }

private:
    int m_slop;
    std::optional<QPoint> m_start;
    /** From the finger to the crosshair. */
    QPoint m_offset;
    QPoint m_crosshair;
    bool m_isDrag = false;
};

} // namespace favrin::eyedropper
