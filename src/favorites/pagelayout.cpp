#include "favorites/pagelayout.h"

#include <algorithm>
#include <cmath>

namespace favrin::favorites {
namespace {

/** What a finger needs, in points. */
constexpr double fingerSize = 44.0;
constexpr double smallestWidth = 50.0;
constexpr int mostSwatchesPerPage = 16;
/** A drag slower than this at its end is judged by where it ends. */
constexpr double turningVelocity = 80.0;

} // namespace

SwatchMetrics swatchMetrics(bool useLandscapeLayout)
{
    return useLandscapeLayout ? SwatchMetrics{28.0, 16.0} : SwatchMetrics{30.0, 18.0};
}

double stripHeight(SwatchMetrics metrics)
{
    return 2.0 * metrics.size + metrics.gap;
}

StripFit stripFit(double availableWidth, SwatchMetrics metrics)
{
    const auto [size, gap] = metrics;
    // Written so that what is not a number becomes the smallest width too.
    const double width = availableWidth > smallestWidth ? availableWidth : smallestWidth;
    const double columns = std::min(std::floor((width + gap) / (size + gap)), mostSwatchesPerPage / 2.0);
    const int shown = static_cast<int>(columns);
    return {2 * shown, std::max((width - (shown * size + (shown - 1) * gap)) / 2.0, 0.0)};
}

PageLayout::PageLayout(SwatchMetrics metrics, int swatchesPerPage)
    : m_metrics(metrics), m_columns(std::max(swatchesPerPage / rows, 1))
{
}

QSizeF PageLayout::pageSize() const
{
    return {stride() - m_metrics.gap, stripHeight(m_metrics)};
}

int PageLayout::pageCount(int itemCount) const
{
    return (itemCount + swatchesPerPage() - 1) / swatchesPerPage();
}

double PageLayout::contentWidth(int itemCount) const
{
    return std::max(pageCount(itemCount), 1) * stride() - m_metrics.gap;
}

int PageLayout::pageOf(int place) const
{
    return place / swatchesPerPage();
}

double PageLayout::offsetOf(int page) const
{
    return page * stride();
}

int PageLayout::pageAt(double offset, int itemCount) const
{
    const double page = std::round(offset / stride());
    return static_cast<int>(std::clamp(page, 0.0, std::max(pageCount(itemCount) - 1.0, 0.0)));
}

int PageLayout::restingPage(double offset, double velocity, int startPage, int itemCount) const
{
    const int last = std::max(pageCount(itemCount) - 1, 0);
    int page = pageAt(offset, itemCount);
    if (std::abs(velocity) >= turningVelocity)
        page = startPage + (velocity > 0.0 ? 1 : -1);
    return std::clamp(std::clamp(page, startPage - 1, startPage + 1), 0, last);
}

QRectF PageLayout::frame(int place) const
{
    const int onPage = place % swatchesPerPage();
    const int row = onPage / m_columns;
    const int column = onPage % m_columns;
    const QPointF topLeft(offsetOf(pageOf(place)) + column * pitch(), row * pitch());
    return {topLeft, QSizeF(m_metrics.size, m_metrics.size)};
}

std::optional<int> PageLayout::placeAt(QPointF point, int itemCount) const
{
    const double reach = std::clamp((fingerSize - m_metrics.size) / 2.0, 0.0, m_metrics.gap / 2.0);
    const QRectF content(0.0, 0.0, contentWidth(itemCount), stripHeight(m_metrics));
    if (!content.adjusted(-reach, -reach, reach, reach).contains(point))
        return std::nullopt;
    const int column = static_cast<int>((point.x() + reach) / pitch());
    const int row = static_cast<int>((point.y() + reach) / pitch());
    const int page = column / m_columns;
    const int place = page * swatchesPerPage() + row * m_columns + column % m_columns;
    if (place >= itemCount || !frame(place).adjusted(-reach, -reach, reach, reach).contains(point))
        return std::nullopt;
    return place;
}

std::pair<int, int> PageLayout::visiblePlaces(double offset, int itemCount) const
{
    const double last = std::max(pageCount(itemCount) - 1.0, 0.0);
    const double right = offset + pageSize().width();
    // Less than the gap: at rest exactly one page is seen.
    const double firstPage = std::clamp(std::floor((offset - edgeReach + m_metrics.gap) / stride()), 0.0, last);
    const double lastPage = std::clamp(std::ceil((right + edgeReach) / stride()) - 1.0, firstPage, last);
    return {std::min(static_cast<int>(firstPage) * swatchesPerPage(), itemCount),
            std::min((static_cast<int>(lastPage) + 1) * swatchesPerPage(), itemCount)};
}

} // namespace favrin::favorites
