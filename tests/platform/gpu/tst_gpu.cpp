#include "platform/gpu/capturemanager.h"
#include "platform/gpu/commandbuffer.h"
#include "platform/gpu/cpu/cpudevice.h"
#include "platform/gpu/cpu/rasterrectangle.h"
#include "platform/gpu/defaultlibrary.h"
#include "platform/gpu/drawable.h"
#include "platform/gpu/systemdevice.h"
#include "platform/gpu/vulkan/vulkaninstance.h"

#include "../../shared/table.h"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QTest>

using namespace favrin::platform::gpu;
using vulkan::DeviceChoice;
using namespace Qt::StringLiterals;

namespace {

using cpu::ShadedVertex;
using Type = vk::PhysicalDeviceType;

/** Passes its place on, as a vertex function of a full-screen field does. */
ShadedVertex passOn(const float *attribute)
{
    return {attribute[0], attribute[1], attribute[0], attribute[1]};
}

constexpr QRgb red = 0xffff0000;

void paintRed(const cpu::FragmentBlock &block, std::span<const std::uint32_t>)
{
    for (std::size_t y = 0; y < block.rows.size(); ++y) {
        for (std::size_t x = 0; x < block.columns.size(); ++x)
            block.pixels[static_cast<std::ptrdiff_t>(y) * block.rowStride + static_cast<std::ptrdiff_t>(x)] = red;
    }
}

/** The two triangles of a rectangle in clip space. */
std::array<float, 12> rectangle(float left, float bottom, float right, float top)
{
    return {left, top, left, bottom, right, bottom, left, top, right, top, right, bottom};
}

RenderPipelineDescriptor redPipeline(Device &device)
{
    const auto library = device.makeDefaultLibrary();
    RenderPipelineDescriptor pipeline;
    pipeline.vertexFunction = library->makeFunction("passOn");
    pipeline.fragmentFunction = library->makeFunction("paintRed");
    pipeline.vertexDescriptor.floatsPerVertex = 2;
    pipeline.colorAttachments[0].pixelFormat = PixelFormat::BGRA8Unorm;
    return pipeline;
}

/** Draws @p vertices in red on a transparent picture of @p size pixels. */
QImage drawn(const std::shared_ptr<Device> &device, std::span<const float> vertices, QSize size)
{
    QImage picture;
    const auto commands = device->makeCommandQueue()->makeCommandBuffer();
    RenderPassDescriptor pass;
    pass.colorAttachments[0].texture = device->makeTexture(size, PixelFormat::BGRA8Unorm);
    const auto encoder = commands->makeRenderCommandEncoder(pass);
    encoder->setRenderPipelineState(device->makeRenderPipelineState(redPipeline(*device), nullptr));
    encoder->setVertexBuffer(device->makeBuffer(std::as_bytes(vertices)), 0, 0);
    encoder->drawPrimitives(PrimitiveType::Triangle, 0, static_cast<std::uint32_t>(vertices.size() / 2));
    encoder->endEncoding();
    commands->present(std::make_shared<Drawable>(pass.colorAttachments[0].texture,
                                                 [&picture](const QImage &image) { picture = image; }));
    commands->commit();
    return picture;
}

int redPixels(const QImage &image)
{
    int count = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            count += image.pixel(x, y) == red ? 1 : 0;
    }
    return count;
}

} // namespace

class GpuTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        setDefaultLibraryContents({.spirvFolder = {},
                                   .vertexFunctions = {{"passOn", passOn}},
                                   .fragmentFunctions = {{"paintRed", paintRed}}});
    }

    void policyChoosesTheDevice_data()
    {
        addRows<QByteArray, bool, DevicePolicy>({
            {"no GPU", {}, false, DevicePolicy::ProcessorOnly},
            {"a GPU", {}, true, DevicePolicy::Hardware},
            {"a GPU not to be used", "processor", true, DevicePolicy::ProcessorOnly},
            {"a GPU that is not shown", "hardware", false, DevicePolicy::Hardware},
            {"any driver", "vulkan", false, DevicePolicy::AnyVulkanDevice},
            {"unknown setting", "Vulkan2", false, DevicePolicy::ProcessorOnly},
        });
    }
    void policyChoosesTheDevice()
    {
        const auto [setting, systemShowsGpu, policy] = row<QByteArray, bool, DevicePolicy>();
        QCOMPARE(devicePolicy(setting, systemShowsGpu), policy);
    }

    void hardwareIsPreferred_data()
    {
        const auto hardware = DeviceChoice::HardwareOnly;
        const auto any = DeviceChoice::AnyDevice;
        addRows<std::vector<Type>, DeviceChoice, int>({
            {"none", {}, any, -1},
            {"the processor is no hardware", {Type::eCpu}, hardware, -1},
            {"the processor will do", {Type::eCpu}, any, 0},
            {"hardware before the processor", {Type::eCpu, Type::eVirtualGpu}, any, 1},
            {"its own before shared", {Type::eIntegratedGpu, Type::eDiscreteGpu}, hardware, 1},
            {"the first of equals", {Type::eDiscreteGpu, Type::eDiscreteGpu}, hardware, 0},
            {"what it is not told", {Type::eOther}, hardware, -1},
        });
    }
    void hardwareIsPreferred()
    {
        const auto [types, choice, index] = row<std::vector<Type>, DeviceChoice, int>();
        const auto chosen = vulkan::preferredDevice(types, choice);
        QCOMPARE(chosen ? static_cast<int>(*chosen) : -1, index);
    }

    void rectangleCoversPixels_data()
    {
        addRows<QRectF, QRect>({
            // Left and bottom, then width and height.
            {"everything", {-1.0, -1.0, 2.0, 2.0}, {0, 0, 8, 4}},
            {"top left quarter", {-1.0, 0.0, 1.0, 1.0}, {0, 0, 4, 2}},
            {"reaches beyond", {-3.0, -3.0, 6.0, 6.0}, {0, 0, 8, 4}},
            {"half a pixel belongs to whom its middle does", {-0.875, -1.0, 0.25, 2.0}, {0, 0, 1, 4}},
            {"between two middles", {-0.84, -1.0, 0.1, 2.0}, {1, 0, 0, 4}},
        });
    }
    void rectangleCoversPixels()
    {
        const auto [clip, pixels] = row<QRectF, QRect>();
        const auto corners = rectangle(static_cast<float>(clip.left()), static_cast<float>(clip.top()),
                                       static_cast<float>(clip.right()), static_cast<float>(clip.bottom()));
        std::array<ShadedVertex, 6> vertices;
        for (std::size_t i = 0; i < vertices.size(); ++i)
            vertices[i] = passOn(corners.data() + 2 * i);
        const auto raster = cpu::rasterRectangle(vertices, {8, 4});
        QVERIFY(raster);
        QCOMPARE(raster->pixels, pixels);
        // What is passed on is the place in clip space here: of the middles of the pixels.
        for (int x = 0; x < pixels.width(); ++x)
            QCOMPARE(raster->columns[static_cast<std::size_t>(x)],
                     static_cast<float>((pixels.x() + x + 0.5) / 4.0 - 1.0));
        for (int y = 0; y < pixels.height(); ++y)
            QCOMPARE(raster->rows[static_cast<std::size_t>(y)], static_cast<float>(1.0 - (pixels.y() + y + 0.5) / 2.0));

        // Those are painted, and all others cleared.
        const QImage picture = drawn(m_device, corners, {8, 4});
        QCOMPARE(redPixels(picture), pixels.width() * pixels.height());
        QCOMPARE(picture.pixel(7, 3), pixels.contains(7, 3) ? red : qRgba(0, 0, 0, 0));
    }

    void otherTrianglesAreNoRectangle_data()
    {
        addRows<std::vector<float>>({
            {"the same half twice", {-1, 1, -1, -1, 1, -1, -1, 1, -1, -1, 1, -1}},
            {"halves that overlap", {-1, 1, -1, -1, 1, -1, -1, 1, -1, -1, 1, 1}},
            {"a corner is off", {-1, 1, -1, -1, 1, -1, -1, 1, 0.5F, 1, 1, -1}},
            {"a line", {0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}},
        });
    }
    void otherTrianglesAreNoRectangle()
    {
        const auto [corners] = row<std::vector<float>>();
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(u"upright rectangles only"_s));
        const QImage picture = drawn(m_device, corners, {8, 4});
        QCOMPARE(picture.size(), QSize(8, 4));
        QCOMPARE(redPixels(picture), 0);
    }

    void bufferTooShortDrawsNothing()
    {
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(u"upright rectangles only"_s));
        const auto corners = rectangle(-1.0F, -1.0F, 1.0F, 1.0F);
        RenderPass pass;
        pass.descriptor.colorAttachments[0].texture = m_device->makeTexture({8, 4}, PixelFormat::BGRA8Unorm);
        pass.draws = {{.pipelineState = m_device->makeRenderPipelineState(redPipeline(*m_device), nullptr),
                       .vertexBuffer = m_device->makeBuffer(std::as_bytes(std::span(corners))),
                       .vertexBufferOffset = sizeof(float),
                       .vertexCount = 6}};
        m_device->submit({pass}, [](CommandBufferStatus) {});
        QCOMPARE(redPixels(pass.descriptor.colorAttachments[0].texture->takeImage()), 0);
    }

    void incompleteDescriptionsMakeNothing()
    {
        QVERIFY(!m_device->makeTexture({0, 4}, PixelFormat::BGRA8Unorm));
        QVERIFY(!m_device->makeTexture({4, 4}, PixelFormat::Invalid));
        RenderPipelineDescriptor pipeline = redPipeline(*m_device);
        QVERIFY(m_device->makeRenderPipelineState(pipeline, nullptr));
        pipeline.fragmentFunction = pipeline.vertexFunction;
        QVERIFY(!m_device->makeRenderPipelineState(pipeline, nullptr));
        pipeline.fragmentFunction = m_device->makeDefaultLibrary()->makeFunction("noShader");
        std::string error;
        QVERIFY(!m_device->makeRenderPipelineState(pipeline, &error) && !error.empty());
        pipeline = redPipeline(*m_device);
        pipeline.colorAttachments[0].pixelFormat = PixelFormat::Invalid;
        QVERIFY(!m_device->makeRenderPipelineState(pipeline, nullptr));
    }

    void captureWritesItsFrames()
    {
        const QTemporaryDir folder;
        const auto corners = rectangle(-1.0F, 0.0F, 0.0F, 1.0F);
        auto &manager = CaptureManager::shared();
        QVERIFY(!manager.startCapture({nullptr, folder.path()}));
        QVERIFY(manager.startCapture({m_device, folder.path()}));
        QVERIFY(!manager.startCapture({m_device, folder.path()}));
        drawn(std::make_shared<cpu::CpuDevice>(), corners, {8, 4});
        const QImage first = drawn(m_device, corners, {8, 4});
        drawn(m_device, corners, {6, 2});
        manager.stopCapture();
        drawn(m_device, corners, {8, 4});

        QCOMPARE(QDir(folder.path()).entryList(QDir::Files, QDir::Name),
                 (QStringList{u"frame-1.json"_s, u"frame-1.png"_s, u"frame-2.json"_s, u"frame-2.png"_s}));
        const QImage picture = QImage(folder.filePath(u"frame-1.png"_s)).convertToFormat(first.format());
        QCOMPARE(picture, first);
        QFile file(folder.filePath(u"frame-2.json"_s));
        QVERIFY(file.open(QIODevice::ReadOnly));
        const QJsonObject pass =
            QJsonDocument::fromJson(file.readAll())[u"renderPasses"_s].toArray().first().toObject();
        QCOMPARE(pass[u"width"_s].toInt(), 6);
        const QJsonObject draw = pass[u"draws"_s].toArray().first().toObject();
        QCOMPARE(draw[u"vertexCount"_s].toInt(), 6);
        QCOMPARE(draw[u"vertexBufferLength"_s].toInt(), 48);
    }

private:
    std::shared_ptr<Device> m_device = std::make_shared<cpu::CpuDevice>();
};

QTEST_GUILESS_MAIN(GpuTest)
#include "tst_gpu.moc"
