#pragma once

#include <QPointF>
#include <QRectF>
#include <QSizeF>

#include <optional>
#include <utility>

/** Where the strip's items lie: plain functions and values. Lengths in points; offsets run in reading direction. */
namespace favrin::favorites {

/** Side of a swatch, and the gap between swatches, rows and pages. */
struct SwatchMetrics
{
    double size = 0.0;
    double gap = 0.0;

    bool operator==(const SwatchMetrics &) const = default;
};

SwatchMetrics swatchMetrics(bool useLandscapeLayout);

/** The height of the strip: two rows and the gap between them. The color well beside it is a square of this side. */
double stripHeight(SwatchMetrics metrics);

/** How far the strip shows what lies beyond the edges of a page: the ring around a swatch that has the keyboard. */
inline constexpr double edgeReach = 5.0;

/** How many swatches a page holds in a given width, and what is left of the width on either side of them. */
struct StripFit
{
    int swatchesPerPage = 2;
    double inset = 0.0;

    bool operator==(const StripFit &) const = default;
};

StripFit stripFit(double availableWidth, SwatchMetrics metrics);

/** Items in two rows, row by row and page by page, the pages side by side. */
class PageLayout
{
public:
    PageLayout() = default;
    /** @param swatchesPerPage at least 2 */
    PageLayout(SwatchMetrics metrics, int swatchesPerPage);

    SwatchMetrics metrics() const { return m_metrics; }
    int columns() const { return m_columns; }
    int swatchesPerPage() const { return rows * m_columns; }

    /** Of one page, which is as wide as its swatches. */
    QSizeF pageSize() const;
    int pageCount(int itemCount) const;
    /** From the first page's start to the last one's end; one page at least. */
    double contentWidth(int itemCount) const;

    int pageOf(int place) const;
    /** How far the strip is scrolled when it shows the page. */
    double offsetOf(int page) const;
    /** The page of which the strip shows most. For any offset there is, and any number of pages. */
    int pageAt(double offset, int itemCount) const;
    /**
     * The page to come to rest on when a drag ends.
     * @param velocity in points per second, positive towards later pages
     * @param startPage where the drag began; a drag turns one page at most
     */
    int restingPage(double offset, double velocity, int startPage, int itemCount) const;

    /** The area of an item within the content. */
    QRectF frame(int place) const;
    /** The item that a finger at a point of the content means: swatches reach as far as it needs. */
    std::optional<int> placeAt(QPointF point, int itemCount) const;
    /** The first item that may be seen at an offset, and the one after the last. */
    std::pair<int, int> visiblePlaces(double offset, int itemCount) const;

    bool operator==(const PageLayout &) const = default;

private:
    static constexpr int rows = 2;

    double stride() const { return m_columns * pitch(); }
    double pitch() const { return m_metrics.size + m_metrics.gap; }

    SwatchMetrics m_metrics = swatchMetrics(false);
    int m_columns = 1;
};

} // namespace favrin::favorites
