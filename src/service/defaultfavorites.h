#pragma once

#include "model/somecolor.h"

#include <vector>

namespace favrin::service {

/** The favorites of somebody who has not chosen any yet, all opaque, in @p space and tagged with it. */
std::vector<model::SomeColor> defaultFavorites(model::SomeColor::ColorSpace space);

} // namespace favrin::service
