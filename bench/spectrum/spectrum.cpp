// Times what the spectrum costs: filling the field by the processor against writing its bytes, starting a Vulkan driver
// and drawing by it (a software driver where there is no hardware), mapping colors and places per call, and a step of a
// drag from the event to the written color and to the finished frame.

#include "spectrum/spectrum.h"
#include "platform/gpu/commandbuffer.h"
#include "platform/gpu/cpu/cpudevice.h"
#include "platform/gpu/drawable.h"
#include "platform/gpu/vulkan/vulkandevice.h"
#include "spectrum/fieldblock.h"
#include "spectrum/spectrummapping.h"
#include "spectrum/spectrumrenderer.h"

#include <benchmark/benchmark.h>

#include <QGuiApplication>
#include <QMouseEvent>
#include <QQuickWindow>

#include <cmath>
#include <cstring>
#include <numbers>

using namespace favrin;
using namespace favrin::platform::gpu;
using namespace favrin::spectrum;
using model::SomeColor;

namespace {

constexpr QSize fieldSize(1080, 900);
constexpr auto pixelCount = static_cast<std::size_t>(fieldSize.width()) * static_cast<std::size_t>(fieldSize.height());
constexpr std::size_t byteCount = pixelCount * sizeof(std::uint32_t);
/** More than any cache holds. */
constexpr std::size_t ringLength = 64;

std::vector<float> middles(int count, float from, float to)
{
    std::vector<float> values;
    for (int i = 0; i < count; ++i)
        values.push_back(from + (to - from) * (static_cast<float>(i) + 0.5F) / static_cast<float>(count));
    return values;
}

void writeBytes(benchmark::State &state)
{
    std::vector<std::uint32_t> ring(pixelCount * static_cast<std::size_t>(state.range(0)));
    std::size_t turn = 0;
    for (auto _ : state) {
        std::uint32_t *pixels = ring.data() + pixelCount * (turn++ % static_cast<std::size_t>(state.range(0)));
        std::memset(pixels, static_cast<int>(turn), byteCount);
        benchmark::ClobberMemory();
    }
}
BENCHMARK(writeBytes)->Arg(1)->Arg(ringLength)->Unit(benchmark::kMicrosecond);

void fill(benchmark::State &state, void (*fillBlock)(const cpu::FragmentBlock &))
{
    std::vector<std::uint32_t> ring(pixelCount * static_cast<std::size_t>(state.range(0)));
    const auto columns = middles(fieldSize.width(), -1.0F, 1.0F);
    const auto rows = middles(fieldSize.height(), 1.0F, -1.0F);
    std::size_t turn = 0;
    for (auto _ : state) {
        std::uint32_t *pixels = ring.data() + pixelCount * (turn++ % static_cast<std::size_t>(state.range(0)));
        fillBlock({.columns = columns, .rows = rows, .pixels = pixels, .rowStride = fieldSize.width()});
        benchmark::ClobberMemory();
    }
}
BENCHMARK_CAPTURE(fill, sRGB, fillWithField)->Arg(1)->Arg(ringLength)->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(fill, displayP3, fillWithFieldInDisplayP3)->Arg(1)->Unit(benchmark::kMicrosecond);

/** A view of fieldSize pixels that is part of no window: a renderer sets itself up on it, frames go past it. */
struct Target
{
    explicit Target(std::shared_ptr<Device> device) : renderer(view, std::move(device)) {}

    /** Draws a frame into a new texture, as the renderer does, and waits for it. False when it failed. */
    bool draw()
    {
        const auto texture = renderer.device()->makeTexture(fieldSize, view.colorPixelFormat());
        if (!texture || !renderer.pipelineState())
            return false;
        QImage picture;
        std::optional<CommandBufferStatus> status;
        const auto commands = renderer.commandQueue()->makeCommandBuffer();
        RenderPassDescriptor descriptor;
        descriptor.colorAttachments[0].texture = texture;
        const auto encoder = commands->makeRenderCommandEncoder(descriptor);
        encoder->setRenderPipelineState(renderer.pipelineState());
        encoder->setVertexBuffer(renderer.vertexBuffer(), 0, 0);
        encoder->drawPrimitives(PrimitiveType::Triangle, 0, 6);
        encoder->endEncoding();
        commands->present(std::make_shared<Drawable>(texture, [&picture](const QImage &image) { picture = image; }));
        commands->addCompletedHandler([&status](CommandBufferStatus result) { status = result; });
        commands->commit();
        while (!status)
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        return picture.size() == fieldSize;
    }

    VexelView view;
    SpectrumRenderer renderer;
};

std::shared_ptr<vulkan::VulkanDevice> vulkanDevice()
{
    vulkan::VulkanOptions options;
    options.choice = vulkan::DeviceChoice::AnyDevice;
    return vulkan::VulkanDevice::create(options, nullptr);
}

/** From no driver at all to the first picture in memory. Only the first in a process finds nothing loaded. */
void vulkanSetupAndFirstFrame(benchmark::State &state)
{
    for (auto _ : state) {
        const auto device = vulkanDevice();
        if (!device || !Target(device).draw())
            state.SkipWithError("no Vulkan device");
    }
}
BENCHMARK(vulkanSetupAndFirstFrame)->Iterations(1)->UseRealTime()->Unit(benchmark::kMillisecond);

void frame(benchmark::State &state, const std::shared_ptr<Device> &device)
{
    if (!device) {
        state.SkipWithError("no Vulkan device");
        return;
    }
    Target target(device);
    for (auto _ : state) {
        if (!target.draw())
            state.SkipWithError("a frame failed");
    }
    state.SetLabel(device->name());
}

void vulkanFrame(benchmark::State &state)
{
    frame(state, vulkanDevice());
}
BENCHMARK(vulkanFrame)->UseRealTime()->Unit(benchmark::kMillisecond);

void processorFrame(benchmark::State &state)
{
    frame(state, std::make_shared<cpu::CpuDevice>());
}
BENCHMARK(processorFrame)->UseRealTime()->Unit(benchmark::kMillisecond);

/** Places all over the field, one after the other. */
QPointF nextPlace(double &turn)
{
    turn += std::numbers::phi;
    return {2.0 * (turn - std::floor(turn)) - 1.0, 2.0 * (turn * 0.37 - std::floor(turn * 0.37)) - 1.0};
}

void colorAtLocation(benchmark::State &state)
{
    double turn = 0.0;
    for (auto _ : state)
        benchmark::DoNotOptimize(SpectrumRenderer::colorAtLocation(nextPlace(turn)));
}
BENCHMARK(colorAtLocation);

void positionForColor(benchmark::State &state)
{
    double turn = 0.0;
    std::vector<FieldColor> colors;
    for (int i = 0; i < 1024; ++i) {
        const QPointF place = nextPlace(turn);
        colors.push_back(fieldColor({static_cast<float>(place.x()), static_cast<float>(place.y())}));
    }
    std::size_t index = 0;
    for (auto _ : state)
        benchmark::DoNotOptimize(SpectrumRenderer::positionForColor(colors[index++ % colors.size()]));
}
BENCHMARK(positionForColor);

/** A spectrum of 328 × 273 points in a window, with a finger on it. */
class Drag
{
public:
    Drag()
    {
        spectrum = new Spectrum(window.contentItem());
        spectrum->setSize({328.0, 273.0});
        spectrum->setColorPickerState(&pickerState);
        window.resize(328, 273);
        window.show();
        while (!window.isExposed())
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        window.grabWindow();
        send(QEvent::MouseButtonPress, {10.0, 10.0});
    }

    void step()
    {
        const QPointF place = nextPlace(m_turn);
        send(QEvent::MouseMove, {164.0 + 160.0 * place.x(), 136.0 + 130.0 * place.y()});
    }

    service::ColorPickerState pickerState = service::ColorPickerState({});
    QQuickWindow window;
    Spectrum *spectrum;

private:
    void send(QEvent::Type type, QPointF position)
    {
        QMouseEvent event(type, position, position, Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(&window, &event);
    }

    double m_turn = 0.0;
};

void dragStep(benchmark::State &state)
{
    Drag drag;
    for (auto _ : state)
        drag.step();
    if (!drag.pickerState.isVolatile())
        state.SkipWithError("nothing was dragged");
}
BENCHMARK(dragStep)->Unit(benchmark::kMicrosecond);

/** The frame is grabbed, which draws all of the window: the upper bound of a step's frame. */
void dragStepAndFrame(benchmark::State &state)
{
    Drag drag;
    for (auto _ : state) {
        drag.step();
        benchmark::DoNotOptimize(drag.window.grabWindow());
    }
}
BENCHMARK(dragStepAndFrame)->UseRealTime()->Unit(benchmark::kMicrosecond);

} // namespace

int main(int argc, char *argv[])
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qputenv("QT_QUICK_BACKEND", "software");
    qputenv("QSG_RENDER_LOOP", "basic");
    QGuiApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
