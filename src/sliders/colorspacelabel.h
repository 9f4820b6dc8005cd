#pragma once

#include "model/somecolor.h"

#include <QString>

namespace favrin::sliders {

/** The caption of the hex field, which names the space of its digits: "sRGB Hex Color #". Localized. */
QString colorSpaceLabel(model::SomeColor::ColorSpace space);

} // namespace favrin::sliders
