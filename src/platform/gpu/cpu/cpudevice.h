#pragma once

#include "platform/gpu/device.h"

namespace favrin::platform::gpu::cpu {

/**
 * The processor in the place of a GPU: the same commands, run at once when they are committed. It draws pairs of
 * triangles that make up an upright rectangle, which is all that a full-screen field needs, and nothing else.
 */
class CpuDevice : public Device
{
public:
    std::string name() const override;
    Kind kind() const override { return Kind::Software; }
    std::shared_ptr<Buffer> makeBuffer(std::span<const std::byte> bytes) override;
    std::shared_ptr<Library> makeDefaultLibrary() override;
    std::shared_ptr<Texture> makeTexture(QSize size, PixelFormat format) override;
    std::shared_ptr<RenderPipelineState> makeRenderPipelineState(const RenderPipelineDescriptor &descriptor,
                                                                 std::string *error) override;
    void submit(std::vector<RenderPass> passes, CompletedHandler completed) override;
};

} // namespace favrin::platform::gpu::cpu
