#include "host/presentationlayout.h"

#include <algorithm>
#include <cmath>

namespace favrin::host {

namespace {

constexpr QSizeF usualSize(360, 560);
/** A window this narrow is a phone: the panel becomes a sheet that spans it. */
constexpr double sheetBreakpoint = 450;
constexpr double cornerRadius = 14;
constexpr double margin = 16;
constexpr double popoverMargin = 8;
constexpr double arrowHeight = 11;
/** The arrow keeps clear of the rounded corners. */
constexpr double arrowInset = 28;

QSizeF fitted(QSizeF preferred, QSizeF available)
{
    const QSizeF wanted = preferred.isEmpty() ? usualSize : preferred;
    // Whole points, of which nothing is cut off: the surface's pixels then fall on the window's.
    const QSizeF whole(std::ceil(wanted.width()), std::ceil(wanted.height()));
    return whole.boundedTo(available).expandedTo(QSizeF(1, 1));
}

PresentationLayout sheet(QSizeF window, QSizeF preferred)
{
    const double height = fitted(preferred, window).height();
    return {.panel = QRectF(0, window.height() - height, window.width(), height),
            // Nothing of the window is left above a sheet that fills it.
            .topRadius = height < window.height() ? cornerRadius : 0,
            .bottomRadius = 0,
            .arrowEdge = ArrowEdge::None,
            .arrowTip = {}};
}

PresentationLayout card(QSizeF window, QSizeF preferred)
{
    const QSizeF size = fitted(preferred, window - QSizeF(2 * margin, 2 * margin));
    const QPointF origin(std::floor((window.width() - size.width()) / 2),
                         std::floor((window.height() - size.height()) / 2));
    return {.panel = QRectF(origin, size),
            .topRadius = cornerRadius,
            .bottomRadius = cornerRadius,
            .arrowEdge = ArrowEdge::None,
            .arrowTip = {}};
}

double clampedTo(double value, double low, double high)
{
    return std::max(low, std::min(value, high));
}

PresentationLayout popover(QSizeF window, QSizeF preferred, const QRectF &anchor)
{
    const double below = window.height() - anchor.bottom() - arrowHeight - popoverMargin;
    const double above = anchor.top() - arrowHeight - popoverMargin;
    const QSizeF wanted = fitted(preferred, window - QSizeF(2 * popoverMargin, 2 * popoverMargin));
    const bool pointsUp = below >= std::min(wanted.height(), above) || below >= above;
    const double room = std::max(pointsUp ? below : above, 1.0);
    const QSizeF size(wanted.width(), std::min(wanted.height(), room));
    const double x =
        clampedTo(anchor.center().x() - size.width() / 2, popoverMargin, window.width() - popoverMargin - size.width());
    const double y = pointsUp ? anchor.bottom() + arrowHeight : anchor.top() - arrowHeight - size.height();
    const QRectF panel(QPointF(std::floor(x), std::floor(y)), size);
    const double tip = clampedTo(anchor.center().x(), panel.left() + arrowInset, panel.right() - arrowInset);
    return {.panel = panel,
            .topRadius = cornerRadius,
            .bottomRadius = cornerRadius,
            .arrowEdge = pointsUp ? ArrowEdge::Top : ArrowEdge::Bottom,
            .arrowTip = QPointF(tip, pointsUp ? panel.top() - arrowHeight : panel.bottom() + arrowHeight)};
}

} // namespace

PresentationLayout layoutPresentation(PresentationStyle style, QSizeF window, QSizeF preferred, const QRectF &anchor)
{
    switch (style) {
    case PresentationStyle::Embedded:
        return {.panel = QRectF(QPointF(), window),
                .topRadius = 0,
                .bottomRadius = 0,
                .arrowEdge = ArrowEdge::None,
                .arrowTip = {}};
    case PresentationStyle::Popover:
        return popover(window, preferred, anchor);
    case PresentationStyle::Presented:
        return window.width() <= sheetBreakpoint ? sheet(window, preferred) : card(window, preferred);
    }
    return {};
}

} // namespace favrin::host
