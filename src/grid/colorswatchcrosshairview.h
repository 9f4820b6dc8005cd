#pragma once

#include "grid/rectcorner.h"
#include "platform/shapes/crisppainteditem.h"

namespace favrin::grid {

/** The selection marker: a thin frame in the background color around a cell, with a soft shadow around the frame. */
class ColorSwatchCrosshairView : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT

public:
    explicit ColorSwatchCrosshairView(QQuickItem *parent = nullptr);

    /** The outer corner of the grid that the marked cell touches; its radius matches the grid's. */
    RectCorners maskedCorner() const { return m_maskedCorner; }
    void setMaskedCorner(RectCorners corner);

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    RectCorners m_maskedCorner;
};

} // namespace favrin::grid
