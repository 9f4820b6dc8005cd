#pragma once

#include "platform/gpu/cpu/cpufunctions.h"

namespace favrin::spectrum {

// The field for the processor: each row has one hue and each column one lightness, so that a pixel is left with one
// multiplication and one addition for each component. The arithmetic is that of fieldColor(), bit for bit.

/** Pixels of a surface that reads them as sRGB. */
void fillWithField(const platform::gpu::cpu::FragmentBlock &block);
/** Pixels of a surface that reads them as Display P3. */
void fillWithFieldInDisplayP3(const platform::gpu::cpu::FragmentBlock &block);

} // namespace favrin::spectrum
