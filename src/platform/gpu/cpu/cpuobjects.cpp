#include "platform/gpu/cpu/cpuobjects.h"

#include "platform/gpu/defaultlibrary.h"

#include <algorithm>

namespace favrin::platform::gpu::cpu {

QImage &CpuTexture::image()
{
    if (m_image.isNull())
        m_image = QImage(m_size, QImage::Format_ARGB32_Premultiplied);
    return m_image;
}

std::shared_ptr<Function> CpuLibrary::makeFunction(std::string_view name, std::span<const std::uint32_t> constants)
{
    const auto isNamed = [name](const auto &function) { return function.name == name; };
    const ShaderLibraryContents &contents = defaultLibraryContents();
    const auto vertex = std::ranges::find_if(contents.vertexFunctions, isNamed);
    if (vertex != contents.vertexFunctions.end())
        return std::make_shared<CpuFunction>(*vertex);
    const auto fragment = std::ranges::find_if(contents.fragmentFunctions, isNamed);
    if (fragment != contents.fragmentFunctions.end())
        return std::make_shared<CpuFunction>(*fragment, constants);
    return nullptr;
}

} // namespace favrin::platform::gpu::cpu
