#pragma once

#include "host/session/pickerplace.h"

#include <QRectF>
#include <QSizeF>

namespace favrin::host {

/** The side of the panel at which a popover's arrow sticks out. */
enum class ArrowEdge { None, Top, Bottom };

/** Points, in the window's coordinates. */
struct PresentationLayout
{
    /** The panel without its arrow; the picker fills it. */
    QRectF panel;
    double topRadius = 0.0;
    double bottomRadius = 0.0;
    ArrowEdge arrowEdge = ArrowEdge::None;
    /** The arrow's tip. */
    QPointF arrowTip;

    bool operator==(const PresentationLayout &) const = default;
};

/**
 * Places a panel for a picker of @p preferred size in a window of @p window size. The panel never leaves the window.
 * @p anchor is what a popover points at. A preferred size that is empty counts as the usual size of a picker.
 */
PresentationLayout layoutPresentation(PresentationStyle style, QSizeF window, QSizeF preferred, const QRectF &anchor);

} // namespace favrin::host
