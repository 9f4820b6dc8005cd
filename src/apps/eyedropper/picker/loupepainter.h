#pragma once

#include "apps/eyedropper/picker/loupegeometry.h"
#include "platform/color/color.h"

#include <QFont>
#include <QImage>

class QPainter;

namespace favrin::eyedropper {

/** What the label says of the sampled color. */
struct LoupeText
{
    QString hex;
    QString name;

    static LoupeText of(const platform::Color &color);
};

/** Paints the loupe and its label. GUI thread. */
class LoupePainter
{
public:
    explicit LoupePainter(double scale);

    const LoupeMetrics &metrics() const { return m_metrics; }
    /** How large the label is with this text. */
    QSize labelSize(const LoupeText &text) const;
    void paint(QPainter &painter, const LoupeGeometry &geometry, const QImage &picture, QPoint crosshair,
               const LoupeText &text) const;

private:
    void paintShadow(QPainter &painter, const LoupeGeometry &geometry) const;
    void paintRing(QPainter &painter, const LoupeGeometry &geometry, const QColor &color) const;
    void paintLens(QPainter &painter, const LoupeGeometry &geometry, const QImage &picture, QPoint crosshair) const;
    void paintCrosshair(QPainter &painter, const LoupeGeometry &geometry) const;
    void paintMark(QPainter &painter, QPoint crosshair) const;
    void paintLabel(QPainter &painter, const QRect &label, const LoupeText &text) const;

    LoupeMetrics m_metrics;
    QFont m_hexFont;
    QFont m_nameFont;
};

} // namespace favrin::eyedropper
