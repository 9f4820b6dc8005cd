#pragma once

#include "platform/gpu/commandqueue.h"
#include "platform/gpu/renderpass.h"

#include <QSize>

#include <functional>

namespace favrin::platform::gpu {

/**
 * Something that draws: a GPU, or the processor in its place. Everything made by a device is used with that device
 * only and keeps it alive. What cannot be made is null, with the reason in the log. Main thread only.
 */
class Device : public std::enable_shared_from_this<Device>
{
public:
    enum class Kind { Hardware, Software };

    virtual ~Device() = default;

    /** For people: the model of the GPU. */
    virtual std::string name() const = 0;
    /** Software when the processor draws, by itself or behind a GPU interface. */
    virtual Kind kind() const = 0;

    std::shared_ptr<CommandQueue> makeCommandQueue();
    /** A buffer with a copy of @p bytes. */
    virtual std::shared_ptr<Buffer> makeBuffer(std::span<const std::byte> bytes) = 0;
    /** The shader library that the program ships. */
    virtual std::shared_ptr<Library> makeDefaultLibrary() = 0;
    /** A texture of @p size pixels. */
    virtual std::shared_ptr<Texture> makeTexture(QSize size, PixelFormat format) = 0;
    /** @param error takes the reason when the result is null; may be null itself, and then nobody is told */
    virtual std::shared_ptr<RenderPipelineState> makeRenderPipelineState(const RenderPipelineDescriptor &descriptor,
                                                                         std::string *error) = 0;

    /**
     * Runs encoded passes; command buffers call it. Never waits for a GPU.
     * @param completed called once on the main thread: before submit() returns where the processor draws, otherwise
     * in a later turn
     */
    virtual void submit(std::vector<RenderPass> passes, CompletedHandler completed) = 0;
};

} // namespace favrin::platform::gpu
