#pragma once

#include <QRectF>

namespace favrin::gallery {

/** Where a picker that is all in view has what the tour touches. In points, from the top left corner of its view. */
class PickerPlaces
{
public:
    PickerPlaces(QSizeF view, Qt::LayoutDirection direction);

    /** The colors of the grid or the spectrum, or the sliders. */
    QRectF tabArea() const;
    /** @param index of the tab, from 0 on */
    QRectF tabSegment(int index) const;

private:
    /** From reading direction to the view. */
    QRectF placed(const QRectF &rect) const;

    QSizeF m_view;
    bool m_mirrored;
    bool m_landscape;
    /** What the padding leaves of the width, and where it starts. */
    double m_padding;
    double m_width;
};

} // namespace favrin::gallery
