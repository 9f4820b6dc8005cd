#pragma once

#include "model/somecolor.h"

#include <QMimeData>

#include <memory>

namespace favrin::sliders {

/**
 * A color for the clipboard, as plain text and in the desktop's form for colors (application/x-color), which knows
 * sRGB only: a color of another space is converted for it.
 */
std::unique_ptr<QMimeData> colorMimeData(const model::SomeColor &color, const QString &text);

} // namespace favrin::sliders
