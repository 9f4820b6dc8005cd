#pragma once

#include <QImage>

class QColor;
class QPainter;

namespace favrin::sliders {

/**
 * A lying capsule of one size. What it cuts and outlines costs little the second time, since the shape is drawn once:
 * the toolkit hands smooth shapes of this height to other threads, and waiting for them takes longer than drawing.
 */
class Capsule
{
public:
    /** @param size pixels, wider than high */
    explicit Capsule(QSize size = {});

    QSize size() const { return m_size; }

    /** Takes what lies outside of the capsule from the picture of this size that is being painted. */
    void cut(QPainter &picture) const;

    /** Draws a line of one pixel inside the edge. */
    void outline(QPainter &painter, const QColor &color);

private:
    QSize m_size;
    /** How much of each pixel lies inside, for the two ends; between them all lies inside. */
    QImage m_left;
    QImage m_right;
    QImage m_outline;
    QRgb m_outlineColor = 0;
};

} // namespace favrin::sliders
