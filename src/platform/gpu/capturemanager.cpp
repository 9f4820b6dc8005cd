#include "platform/gpu/capturemanager.h"

#include "platform/gpu/device.h"
#include "platform/gpu/gpulog.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace favrin::platform::gpu {
namespace {

QJsonObject described(const DrawCommand &draw)
{
    return {
        {QStringLiteral("primitive"), QStringLiteral("triangle")},
        {QStringLiteral("vertexBufferLength"), static_cast<qint64>(draw.vertexBuffer->length())},
        {QStringLiteral("vertexBufferOffset"), static_cast<qint64>(draw.vertexBufferOffset)},
        {QStringLiteral("vertexStart"), static_cast<qint64>(draw.vertexStart)},
        {QStringLiteral("vertexCount"), static_cast<qint64>(draw.vertexCount)},
    };
}

QJsonObject described(const RenderPass &pass)
{
    const auto &[texture, clear] = pass.descriptor.colorAttachments[0];
    QJsonArray draws;
    for (const DrawCommand &draw : pass.draws)
        draws.append(described(draw));
    return {
        {QStringLiteral("width"), texture ? texture->size().width() : 0},
        {QStringLiteral("height"), texture ? texture->size().height() : 0},
        {QStringLiteral("clearColor"), QJsonArray{clear.red, clear.green, clear.blue, clear.alpha}},
        {QStringLiteral("draws"), draws},
    };
}

} // namespace

FrameCapture::FrameCapture(QString pathWithoutSuffix, const Device &device, const std::vector<RenderPass> &passes)
    : m_path(std::move(pathWithoutSuffix))
{
    QJsonArray renderPasses;
    for (const RenderPass &pass : passes)
        renderPasses.append(described(pass));
    m_commands = QJsonDocument(QJsonObject{{QStringLiteral("device"), QString::fromStdString(device.name())},
                                           {QStringLiteral("renderPasses"), renderPasses}})
                     .toJson();
}

void FrameCapture::write(const QImage &image) const
{
    QFile commands(m_path + QStringLiteral(".json"));
    const bool written = commands.open(QIODevice::WriteOnly) && commands.write(m_commands) == m_commands.size();
    if (!written || !image.save(m_path + QStringLiteral(".png")))
        gpuLog().warning("A captured frame could not be written to " + m_path.toStdString());
}

CaptureManager &CaptureManager::shared()
{
    static CaptureManager manager;
    return manager;
}

bool CaptureManager::startCapture(CaptureDescriptor descriptor)
{
    if (isCapturing() || !descriptor.captureObject)
        return false;
    m_descriptor = std::move(descriptor);
    m_frames = 0;
    return true;
}

void CaptureManager::stopCapture()
{
    m_descriptor = {};
}

std::shared_ptr<FrameCapture> CaptureManager::frameCapture(const Device &device, const std::vector<RenderPass> &passes)
{
    if (m_descriptor.captureObject.get() != &device)
        return nullptr;
    const QString path = m_descriptor.outputFolder + QStringLiteral("/frame-") + QString::number(++m_frames);
    return std::make_shared<FrameCapture>(path, device, passes);
}

} // namespace favrin::platform::gpu
