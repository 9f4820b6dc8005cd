#include "platform/gpu/cpu/cpudevice.h"
#include "platform/gpu/vulkan/vulkandevice.h"
#include "service/displaycolor.h"
#include "spectrum/spectrummapping.h"
#include "spectrum/spectrumrenderer.h"

#include <QMutex>
#include <QQuickWindow>
#include <QTest>

#include <cmath>

using namespace favrin;
using namespace favrin::platform::gpu;
using model::SomeColor;
using spectrum::SpectrumRenderer;

namespace {

/** What the validation layer said so far. */
class Complaints
{
public:
    void add(const std::string &text)
    {
        const QMutexLocker locker(&m_mutex);
        m_list.append(QString::fromStdString(text));
    }
    QString text() const
    {
        const QMutexLocker locker(&m_mutex);
        return m_list.join(u'\n');
    }

private:
    mutable QMutex m_mutex;
    QStringList m_list;
};

/** The processor, counting what it is asked to draw. */
class CountingDevice : public cpu::CpuDevice
{
public:
    std::shared_ptr<RenderPipelineState> makeRenderPipelineState(const RenderPipelineDescriptor &descriptor,
                                                                 std::string *error) override
    {
        return compiles ? CpuDevice::makeRenderPipelineState(descriptor, error) : nullptr;
    }
    void submit(std::vector<RenderPass> passes, CompletedHandler completed) override
    {
        ++frames;
        CpuDevice::submit(std::move(passes), std::move(completed));
    }

    bool compiles = true;
    int frames = 0;
};

/** A view of a size in points, set up as the spectrum sets it up, in a window that is shown. */
class ViewWindow
{
public:
    explicit ViewWindow(QSizeF size)
    {
        view = new VexelView(window.contentItem());
        view->setOpaque(true);
        view->setPaused(true);
        view->setEnableSetNeedsDisplay(true);
        view->setSize(size);
        window.resize(600, 500);
        window.show();
    }

    QImage picture() const { return view->render(window.effectiveDevicePixelRatio()); }
    QSize pixels() const { return (view->size() * window.effectiveDevicePixelRatio()).toSize(); }
    /** Shows two more frames, in which whatever is due is drawn. */
    bool passFrames()
    {
        int frames = 0;
        const QObject context;
        QObject::connect(&window, &QQuickWindow::frameSwapped, &context, [&] {
            ++frames;
            window.update();
        });
        window.update();
        return QTest::qWaitFor([&] { return frames >= 2; });
    }

    QQuickWindow window;
    VexelView *view;
};

QRgb expectedPixel(QPoint pixel, QSize size, SomeColor::ColorSpace space)
{
    const platform::Color color = spectrum::colorForPoint(QPointF(pixel) + QPointF(0.5, 0.5), QSizeF(size));
    const SomeColor inSpace(color, space);
    const auto byte = [](double component) { return static_cast<int>(component * 255.0 + 0.5); };
    return qRgb(byte(inSpace.r), byte(inSpace.g), byte(inSpace.b));
}

int distance(QRgb left, QRgb right)
{
    return std::max({std::abs(qRed(left) - qRed(right)), std::abs(qGreen(left) - qGreen(right)),
                     std::abs(qBlue(left) - qBlue(right))});
}

} // namespace

class SpectrumRendererTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        vulkan::VulkanOptions options;
        options.choice = vulkan::DeviceChoice::AnyDevice;
        options.layers = {"VK_LAYER_KHRONOS_validation"};
        options.messageHandler = [this](const std::string &text) { m_complaints.add(text); };
        m_vulkan = vulkan::VulkanDevice::create(options, &m_reason);
    }

    void cleanup()
    {
        service::DisplayColor::instance().setSurfaceColorSpace(SomeColor::ColorSpace::sRGB);
        QCOMPARE(m_complaints.text(), QString());
    }

    void cleanupTestCase()
    {
        // The layer complains of what is left when the device goes.
        m_vulkan.reset();
        QCOMPARE(m_complaints.text(), QString());
    }

    void everyPixelIsTheMappings_data()
    {
        QTest::addColumn<bool>("byVulkan");
        QTest::addColumn<QSizeF>("size");
        QTest::addColumn<SomeColor::ColorSpace>("space");
        for (const bool byVulkan : {false, true}) {
            for (const QSizeF size : {QSizeF(1.0, 1.0), QSizeF(7.0, 5.0), QSizeF(328.0, 273.0), QSizeF(3.0, 400.0)}) {
                for (const auto space : {SomeColor::ColorSpace::sRGB, SomeColor::ColorSpace::displayP3}) {
                    QTest::addRow("%s %g x %g %s", byVulkan ? "Vulkan" : "processor", size.width(), size.height(),
                                  space == SomeColor::ColorSpace::sRGB ? "sRGB" : "Display P3")
                        << byVulkan << size << space;
                }
            }
        }
    }

    void everyPixelIsTheMappings()
    {
        QFETCH(bool, byVulkan);
        QFETCH(QSizeF, size);
        QFETCH(SomeColor::ColorSpace, space);
        if (byVulkan && !m_vulkan)
            QSKIP(m_reason.c_str());
        service::DisplayColor::instance().setSurfaceColorSpace(space);
        ViewWindow window(size);
        const SpectrumRenderer renderer(*window.view, byVulkan ? m_vulkan : m_processor);
        QTRY_COMPARE(window.picture().size(), window.pixels());
        const QImage picture = window.picture();
        int different = 0;
        for (int y = 0; y < picture.height(); ++y) {
            for (int x = 0; x < picture.width(); ++x) {
                const QRgb expected = expectedPixel({x, y}, picture.size(), space);
                const int steps = distance(picture.pixel(x, y), expected);
                QVERIFY2(steps <= 1, qPrintable(QStringLiteral("(%1, %2): %3 in place of %4")
                                                    .arg(x)
                                                    .arg(y)
                                                    .arg(picture.pixel(x, y), 0, 16)
                                                    .arg(expected, 0, 16)));
                different += steps;
            }
        }
        QVERIFY2(different * 1000 <= picture.width() * picture.height(), qPrintable(QString::number(different)));
    }

    void sizeChangeDrawsOnce()
    {
        const auto device = std::make_shared<CountingDevice>();
        ViewWindow window({120.0, 100.0});
        const SpectrumRenderer renderer(*window.view, device);
        QTRY_COMPARE(window.picture().size(), window.pixels());
        QVERIFY(window.passFrames());
        QCOMPARE(device->frames, 1);
        window.view->setWidth(240.0);
        window.view->setHeight(200.0);
        QTRY_COMPARE(window.picture().size(), window.pixels());
        QVERIFY(window.passFrames());
        QCOMPARE(device->frames, 2);
        window.view->setPosition({30.0, 40.0});
        QVERIFY(window.passFrames());
        QCOMPARE(device->frames, 2);
    }

    void whatIsMissingSkipsTheFrame_data()
    {
        QTest::addColumn<QString>("missing");
        for (const char *missing : {"device", "pipeline", "width", "height", "drawable"})
            QTest::newRow(missing) << QString::fromLatin1(missing);
    }

    void whatIsMissingSkipsTheFrame()
    {
        QFETCH(QString, missing);
        const auto device = std::make_shared<CountingDevice>();
        device->compiles = missing != u"pipeline";
        QSizeF size(60.0, 50.0);
        if (missing == u"width")
            size.setWidth(0.0);
        else if (missing == u"height")
            size.setHeight(0.0);
        else if (missing == u"drawable")
            size.setWidth(20000.0);
        ViewWindow window(size);
        SpectrumRenderer renderer(*window.view, missing == u"device" ? nullptr : device);
        QVERIFY(window.passFrames());
        window.view->draw();
        QCOMPARE(device->frames, 0);
        QVERIFY(window.picture().isNull());
        if (missing == u"pipeline")
            QVERIFY(!renderer.pipelineState());
    }

    void missingFunctionMakesNoPipeline()
    {
        if (!m_vulkan)
            QSKIP(m_reason.c_str());
        const auto library = m_vulkan->makeDefaultLibrary();
        QVERIFY(library->makeFunction("vertexShader"));
        QCOMPARE(library->makeFunction("noShader"), nullptr);
        RenderPipelineDescriptor descriptor;
        descriptor.vertexFunction = library->makeFunction("vertexShader");
        descriptor.vertexDescriptor.floatsPerVertex = 2;
        descriptor.colorAttachments[0].pixelFormat = PixelFormat::BGRA8Unorm;
        std::string error;
        QCOMPARE(m_vulkan->makeRenderPipelineState(descriptor, &error), nullptr);
        QVERIFY(!error.empty());
    }

private:
    Complaints m_complaints;
    std::shared_ptr<Device> m_processor = std::make_shared<cpu::CpuDevice>();
    std::shared_ptr<Device> m_vulkan;
    std::string m_reason;
};

QTEST_MAIN(SpectrumRendererTest)
#include "tst_spectrumrenderer.moc"
