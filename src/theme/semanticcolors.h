#pragma once

#include "service/colorpickerstate.h"

#include <QColor>

namespace favrin::theme {

enum class Contrast { Standard, Increased };

/** The colors of the interface by their meaning, in sRGB. */
struct SemanticColors
{
    QColor label;
    QColor secondaryLabel;
    QColor tertiaryLabel;
    /** What lies behind everything; also the frame of markers that lie on a color. */
    QColor systemBackground;
    QColor systemGray;
    QColor systemGray5;
    QColor systemRed;
    QColor separator;
    /** What can be acted on, and the focus ring. */
    QColor tint;
    /** The face of a control, over whatever lies behind it. */
    QColor fill;

    bool operator==(const SemanticColors &) const = default;
};

SemanticColors semanticColors(service::ColorScheme scheme, Contrast contrast);

} // namespace favrin::theme
