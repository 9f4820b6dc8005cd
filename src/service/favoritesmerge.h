#pragma once

#include "model/somecolor.h"

#include <vector>

namespace favrin::service {

/** The colors whose opacity is exactly 1, in their order. */
std::vector<model::SomeColor> opaqueColors(const std::vector<model::SomeColor> &colors);

/**
 * The full list after an edit that saw its opaque colors only: what the edit removed is removed, what it added comes
 * last, and the translucent colors stay where they are.
 * @param stored the full list before the edit
 * @param edited what the edit made of the opaque colors of @p stored
 */
std::vector<model::SomeColor> mergedFavorites(std::vector<model::SomeColor> stored,
                                              const std::vector<model::SomeColor> &edited);

} // namespace favrin::service
