#include "platform/gpu/vulkan/vulkanlibrary.h"

#include "platform/gpu/gpulog.h"

#include <QFile>

#include <cstring>

namespace favrin::platform::gpu::vulkan {
namespace {

/** The words of a SPIR-V module; empty when the file is missing or no such module. */
std::vector<std::uint32_t> moduleWords(const QString &path)
{
    constexpr std::uint32_t magic = 0x07230203U;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QByteArray bytes = file.readAll();
    std::vector<std::uint32_t> words(static_cast<std::size_t>(bytes.size()) / sizeof(std::uint32_t));
    std::memcpy(words.data(), bytes.constData(), words.size() * sizeof(std::uint32_t));
    return !words.empty() && words.front() == magic ? words : std::vector<std::uint32_t>();
}

} // namespace

VulkanFunction::VulkanFunction(std::shared_ptr<VulkanContext> context, std::string name, vk::raii::ShaderModule module,
                               std::span<const std::uint32_t> constants)
    : m_context(std::move(context))
    , m_name(std::move(name))
    , m_module(std::move(module))
    , m_constants(constants.begin(), constants.end())
{
    for (std::uint32_t id = 0; id < m_constants.size(); ++id) {
        vk::SpecializationMapEntry entry;
        entry.constantID = id;
        entry.offset = id * static_cast<std::uint32_t>(sizeof(std::uint32_t));
        entry.size = sizeof(std::uint32_t);
        m_entries.push_back(entry);
    }
    m_specialization.setMapEntries(m_entries);
    m_specialization.setData<std::uint32_t>(m_constants);
}

vk::PipelineShaderStageCreateInfo VulkanFunction::stage(vk::ShaderStageFlagBits stage) const
{
    vk::PipelineShaderStageCreateInfo info;
    info.stage = stage;
    info.module = *m_module;
    info.pName = m_name.c_str();
    info.pSpecializationInfo = &m_specialization;
    return info;
}

VulkanLibrary::VulkanLibrary(std::shared_ptr<VulkanContext> context, QString folder)
    : m_context(std::move(context)), m_folder(std::move(folder))
{
}

std::shared_ptr<Function> VulkanLibrary::makeFunction(std::string_view name, std::span<const std::uint32_t> constants)
{
    const auto fileName = QString::fromUtf8(name.data(), static_cast<qsizetype>(name.size())) + QStringLiteral(".spv");
    const auto words = moduleWords(m_folder + u'/' + fileName);
    if (words.empty())
        return nullptr;
    try {
        vk::ShaderModuleCreateInfo info;
        info.setCode(words);
        return std::make_shared<VulkanFunction>(m_context, std::string(name),
                                                m_context->device().createShaderModule(info), constants);
    } catch (const std::exception &error) {
        gpuLog().warning("The shader function " + std::string(name) + " cannot be used: " + error.what());
        return nullptr;
    }
}

} // namespace favrin::platform::gpu::vulkan
