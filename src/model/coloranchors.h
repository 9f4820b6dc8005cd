#pragma once

#include "model/colorterm.h"
#include "model/oklab.h"

namespace favrin::model {

/**
 * The word people use for a color, by the nearest of a set of anchors: points of Oklab that were placed so that the
 * borders between them run where the answers of a large public color naming survey change. Finite input. Any thread.
 */
ColorTerm nearestColorTerm(const Oklab &color);

} // namespace favrin::model
