#include "platform/gpu/commandbuffer.h"

#include "platform/gpu/capturemanager.h"
#include "platform/gpu/device.h"
#include "platform/gpu/drawable.h"

namespace favrin::platform::gpu {

CommandBuffer::CommandBuffer(std::shared_ptr<Device> device) : m_device(std::move(device)) {}

std::unique_ptr<RenderCommandEncoder> CommandBuffer::makeRenderCommandEncoder(const RenderPassDescriptor &descriptor)
{
    m_passes.push_back({descriptor, {}});
    return std::make_unique<RenderCommandEncoder>(m_passes, m_passes.size() - 1);
}

void CommandBuffer::present(std::shared_ptr<Drawable> drawable)
{
    m_drawable = std::move(drawable);
}

void CommandBuffer::addCompletedHandler(CompletedHandler handler)
{
    m_handlers.push_back(std::move(handler));
}

void CommandBuffer::commit()
{
    const auto capture = CaptureManager::shared().frameCapture(*m_device, m_passes);
    m_device->submit(std::move(m_passes), [drawable = std::move(m_drawable), handlers = std::move(m_handlers),
                                           capture](CommandBufferStatus status) {
        if (drawable && status == CommandBufferStatus::Completed) {
            const QImage image = drawable->texture()->takeImage();
            if (capture)
                capture->write(image);
            drawable->present(image);
        }
        for (const CompletedHandler &handler : handlers)
            handler(status);
    });
}

} // namespace favrin::platform::gpu
