#include "platform/gpu/defaultlibrary.h"

namespace favrin::platform::gpu {
namespace {

ShaderLibraryContents &contents()
{
    static ShaderLibraryContents shipped;
    return shipped;
}

} // namespace

const ShaderLibraryContents &defaultLibraryContents()
{
    return contents();
}

void setDefaultLibraryContents(ShaderLibraryContents newContents)
{
    contents() = std::move(newContents);
}

} // namespace favrin::platform::gpu
