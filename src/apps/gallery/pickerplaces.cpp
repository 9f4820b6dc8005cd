#include "apps/gallery/pickerplaces.h"

namespace favrin::gallery {
namespace {

constexpr double widestPortrait = 500.0;
constexpr double barHeight = 55.0;
constexpr double segmentsHeight = 32.0;
constexpr int numberOfTabs = 3;
constexpr double footerGap = 18.0;
constexpr double aspectRatio = 1.2;

} // namespace

PickerPlaces::PickerPlaces(QSizeF view, Qt::LayoutDirection direction)
    : m_view(view)
    , m_mirrored(direction == Qt::RightToLeft)
    , m_landscape(view.width() > widestPortrait)
    , m_padding(m_landscape ? 20.0 : 16.0)
    , m_width(view.width() - 2.0 * m_padding)
{
}

QRectF PickerPlaces::tabArea() const
{
    const double width = m_landscape ? (m_width - footerGap) / 2.0 : m_width;
    const double top = barHeight + segmentsHeight + (m_landscape ? 16.0 : 20.0);
    return placed({m_padding, top, width, width / aspectRatio});
}

QRectF PickerPlaces::tabSegment(int index) const
{
    const double width = m_width / numberOfTabs;
    return placed({m_padding + index * width, barHeight, width, segmentsHeight});
}

QRectF PickerPlaces::placed(const QRectF &rect) const
{
    return m_mirrored ? QRectF(QPointF(m_view.width() - rect.right(), rect.top()), rect.size()) : rect;
}

} // namespace favrin::gallery
