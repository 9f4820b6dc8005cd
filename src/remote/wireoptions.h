#pragma once

#include "remote/records.h"

#include <cstdint>

/** The yes-or-no properties as the bits of the protocol's enums "option" and "accessibility_option". */
namespace favrin::remote {

std::uint32_t optionBits(const Configuration &configuration);
/**
 * Sets the flags of @p configuration and makes sure that title and suggested colors are there exactly when the bits say
 * so. Bits that are not known are ignored.
 */
void applyOptionBits(std::uint32_t bits, Configuration &configuration);

std::uint32_t accessibilityBits(const Traits &traits);
void applyAccessibilityBits(std::uint32_t bits, Traits &traits);

} // namespace favrin::remote
