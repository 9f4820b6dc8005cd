#pragma once

#include "model/somecolor.h"

#include <cstdint>

namespace favrin::spectrum {

/** Makes "vertexShader" and "fragmentShader" the program's shader library, for every kind of device. */
void installSpectrumShaders();

/** The value of constant 0 of "fragmentShader": the space in which the pixels that it writes are read. */
std::uint32_t surfaceColorSpaceConstant(model::SomeColor::ColorSpace space);

} // namespace favrin::spectrum
