#include "platform/gpu/capturemanager.h"
#include "platform/gpu/commandbuffer.h"
#include "platform/gpu/cpu/cpudevice.h"
#include "platform/gpu/cpu/rasterrectangle.h"
#include "platform/gpu/defaultlibrary.h"
#include "platform/gpu/drawable.h"
#include "platform/gpu/systemdevice.h"
#include "platform/gpu/vulkan/vulkaninstance.h"

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
    void initTestCase();
    void policyChoosesTheDevice_data();
    void policyChoosesTheDevice();
    void hardwareIsPreferred_data();
    void hardwareIsPreferred();
    void rectangleCoversPixels_data();
    void rectangleCoversPixels();
    void otherTrianglesAreNoRectangle_data();
    void otherTrianglesAreNoRectangle();
    void bufferTooShortDrawsNothing();
    void incompleteDescriptionsMakeNothing();
    void captureWritesItsFrames();

private:
    std::shared_ptr<Device> m_device = std::make_shared<cpu::CpuDevice>();
};

void GpuTest::initTestCase()
{
    setDefaultLibraryContents(
        {.spirvFolder = {}, .vertexFunctions = {{"passOn", passOn}}, .fragmentFunctions = {{"paintRed", paintRed}}});
}

void GpuTest::policyChoosesTheDevice_data()
{
    QTest::addColumn<QByteArray>("setting");
    QTest::addColumn<bool>("systemShowsGpu");
    QTest::addColumn<DevicePolicy>("policy");
    QTest::newRow("no GPU") << QByteArray() << false << DevicePolicy::ProcessorOnly;
    QTest::newRow("a GPU") << QByteArray() << true << DevicePolicy::Hardware;
    QTest::newRow("a GPU not to be used") << QByteArray("processor") << true << DevicePolicy::ProcessorOnly;
    QTest::newRow("a GPU that is not shown") << QByteArray("hardware") << false << DevicePolicy::Hardware;
    QTest::newRow("any driver") << QByteArray("vulkan") << false << DevicePolicy::AnyVulkanDevice;
    QTest::newRow("unknown setting") << QByteArray("Vulkan2") << false << DevicePolicy::ProcessorOnly;
}

void GpuTest::policyChoosesTheDevice()
{
    QFETCH(QByteArray, setting);
    QFETCH(bool, systemShowsGpu);
    QFETCH(DevicePolicy, policy);
    QCOMPARE(devicePolicy(setting, systemShowsGpu), policy);
}

void GpuTest::hardwareIsPreferred_data()
{
    QTest::addColumn<std::vector<Type>>("types");
    QTest::addColumn<DeviceChoice>("choice");
    QTest::addColumn<int>("index");
    const auto hardware = DeviceChoice::HardwareOnly;
    const auto any = DeviceChoice::AnyDevice;
    QTest::newRow("none") << std::vector<Type>() << any << -1;
    QTest::newRow("the processor is no hardware") << std::vector{Type::eCpu} << hardware << -1;
    QTest::newRow("the processor will do") << std::vector{Type::eCpu} << any << 0;
    QTest::newRow("hardware before the processor") << std::vector{Type::eCpu, Type::eVirtualGpu} << any << 1;
    QTest::newRow("its own before shared") << std::vector{Type::eIntegratedGpu, Type::eDiscreteGpu} << hardware << 1;
    QTest::newRow("the first of equals") << std::vector{Type::eDiscreteGpu, Type::eDiscreteGpu} << hardware << 0;
    QTest::newRow("what it is not told") << std::vector{Type::eOther} << hardware << -1;
}

void GpuTest::hardwareIsPreferred()
{
    QFETCH(std::vector<Type>, types);
    QFETCH(DeviceChoice, choice);
    QFETCH(int, index);
    const auto chosen = vulkan::preferredDevice(types, choice);
    QCOMPARE(chosen ? static_cast<int>(*chosen) : -1, index);
}

void GpuTest::rectangleCoversPixels_data()
{
    QTest::addColumn<QRectF>("clip");
    QTest::addColumn<QRect>("pixels");
    // Left and bottom, then width and height.
    QTest::newRow("everything") << QRectF(-1.0, -1.0, 2.0, 2.0) << QRect(0, 0, 8, 4);
    QTest::newRow("top left quarter") << QRectF(-1.0, 0.0, 1.0, 1.0) << QRect(0, 0, 4, 2);
    QTest::newRow("reaches beyond") << QRectF(-3.0, -3.0, 6.0, 6.0) << QRect(0, 0, 8, 4);
    QTest::newRow("half a pixel belongs to whom its middle does")
        << QRectF(-0.875, -1.0, 0.25, 2.0) << QRect(0, 0, 1, 4);
    QTest::newRow("between two middles") << QRectF(-0.84, -1.0, 0.1, 2.0) << QRect(1, 0, 0, 4);
}

void GpuTest::rectangleCoversPixels()
{
    QFETCH(QRectF, clip);
    QFETCH(QRect, pixels);
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
        QCOMPARE(raster->columns[static_cast<std::size_t>(x)], static_cast<float>((pixels.x() + x + 0.5) / 4.0 - 1.0));
    for (int y = 0; y < pixels.height(); ++y)
        QCOMPARE(raster->rows[static_cast<std::size_t>(y)], static_cast<float>(1.0 - (pixels.y() + y + 0.5) / 2.0));

    // Those are painted, and all others cleared.
    const QImage picture = drawn(m_device, corners, {8, 4});
    QCOMPARE(redPixels(picture), pixels.width() * pixels.height());
    QCOMPARE(picture.pixel(7, 3), pixels.contains(7, 3) ? red : qRgba(0, 0, 0, 0));
}

void GpuTest::otherTrianglesAreNoRectangle_data()
{
    QTest::addColumn<std::vector<float>>("corners");
    QTest::newRow("the same half twice") << std::vector<float>{-1, 1, -1, -1, 1, -1, -1, 1, -1, -1, 1, -1};
    QTest::newRow("halves that overlap") << std::vector<float>{-1, 1, -1, -1, 1, -1, -1, 1, -1, -1, 1, 1};
    QTest::newRow("a corner is off") << std::vector<float>{-1, 1, -1, -1, 1, -1, -1, 1, 0.5F, 1, 1, -1};
    QTest::newRow("a line") << std::vector<float>{0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0};
}

void GpuTest::otherTrianglesAreNoRectangle()
{
    QFETCH(std::vector<float>, corners);
    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("upright rectangles only")));
    const QImage picture = drawn(m_device, corners, {8, 4});
    QCOMPARE(picture.size(), QSize(8, 4));
    QCOMPARE(redPixels(picture), 0);
}

void GpuTest::bufferTooShortDrawsNothing()
{
    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("upright rectangles only")));
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

void GpuTest::incompleteDescriptionsMakeNothing()
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

void GpuTest::captureWritesItsFrames()
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
             (QStringList{QStringLiteral("frame-1.json"), QStringLiteral("frame-1.png"), QStringLiteral("frame-2.json"),
                          QStringLiteral("frame-2.png")}));
    const QImage picture = QImage(folder.filePath(QStringLiteral("frame-1.png"))).convertToFormat(first.format());
    QCOMPARE(picture, first);
    QFile file(folder.filePath(QStringLiteral("frame-2.json")));
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QJsonObject pass =
        QJsonDocument::fromJson(file.readAll())[QStringLiteral("renderPasses")].toArray().first().toObject();
    QCOMPARE(pass[QStringLiteral("width")].toInt(), 6);
    const QJsonObject draw = pass[QStringLiteral("draws")].toArray().first().toObject();
    QCOMPARE(draw[QStringLiteral("vertexCount")].toInt(), 6);
    QCOMPARE(draw[QStringLiteral("vertexBufferLength")].toInt(), 48);
}

QTEST_GUILESS_MAIN(GpuTest)
#include "tst_gpu.moc"
