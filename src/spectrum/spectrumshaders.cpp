#include "spectrum/spectrumshaders.h"

#include "platform/gpu/defaultlibrary.h"
#include "spectrum/fieldblock.h"

namespace favrin::spectrum {

using namespace platform::gpu;

namespace {

constexpr std::uint32_t displayP3Surface = 1;

cpu::ShadedVertex vertexShader(const float *attribute)
{
    return {attribute[0], attribute[1], attribute[0], attribute[1]};
}

void fragmentShader(const cpu::FragmentBlock &block, std::span<const std::uint32_t> constants)
{
    if (!constants.empty() && constants[0] == displayP3Surface)
        fillWithFieldInDisplayP3(block);
    else
        fillWithField(block);
}

} // namespace

void installSpectrumShaders()
{
    if (!defaultLibraryContents().spirvFolder.isEmpty())
        return;
    setDefaultLibraryContents({
        .spirvFolder = QStringLiteral(":/favrin/shaders"),
        .vertexFunctions = {{"vertexShader", vertexShader}},
        .fragmentFunctions = {{"fragmentShader", fragmentShader}},
    });
}

std::uint32_t surfaceColorSpaceConstant(model::SomeColor::ColorSpace space)
{
    return space == model::SomeColor::ColorSpace::displayP3 ? displayP3Surface : 0;
}

} // namespace favrin::spectrum
