#pragma once

#include "platform/gpu/cpu/cpufunctions.h"

#include <QString>

#include <vector>

namespace favrin::platform::gpu {

/** The shader functions that the program ships, for every kind of device under the same names. */
struct ShaderLibraryContents
{
    /** A folder with one SPIR-V module NAME.spv for each function; the entry point is called NAME. */
    QString spirvFolder;
    std::vector<cpu::CpuVertexFunction> vertexFunctions;
    std::vector<cpu::CpuFragmentFunction> fragmentFunctions;
};

/** What Device::makeDefaultLibrary() loads; empty until the program says what it ships. Main thread only. */
const ShaderLibraryContents &defaultLibraryContents();
void setDefaultLibraryContents(ShaderLibraryContents contents);

} // namespace favrin::platform::gpu
