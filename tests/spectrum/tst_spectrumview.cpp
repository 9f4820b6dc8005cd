#include "platform/gpu/systemdevice.h"
#include "platform/gpu/vulkan/vulkandevice.h"
#include "spectrum/spectrumview.h"

#include <QQuickWindow>
#include <QSignalSpy>
#include <QTest>

using namespace favrin;
using namespace favrin::platform::gpu;
using spectrum::SpectrumView;

namespace {

int largestDistance(const QImage &left, const QImage &right)
{
    int largest = left.size() == right.size() ? 0 : 255;
    for (int y = 0; largest < 255 && y < left.height(); ++y) {
        for (int x = 0; x < left.width(); ++x) {
            const QRgb a = left.pixel(x, y);
            const QRgb b = right.pixel(x, y);
            largest = std::max(
                {largest, std::abs(qRed(a) - qRed(b)), std::abs(qGreen(a) - qGreen(b)), std::abs(qBlue(a) - qBlue(b))});
        }
    }
    return largest;
}

bool isVulkan(const std::shared_ptr<Device> &device)
{
    return std::dynamic_pointer_cast<vulkan::VulkanDevice>(device) != nullptr;
}

} // namespace

class SpectrumViewTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        // Left to itself, a machine without a GPU would look for no driver.
        qputenv("FAVRIN_GPU", "vulkan");
    }

    void processorDrawsUntilTheDriverIsReady()
    {
        std::string reason;
        vulkan::VulkanOptions options;
        options.choice = vulkan::DeviceChoice::AnyDevice;
        if (!vulkan::VulkanDevice::create(options, &reason))
            QSKIP(reason.c_str());

        QSignalSpy changes(&SystemDevice::instance(), &SystemDevice::deviceChanged);
        QQuickWindow window;
        window.resize(360, 300);
        SpectrumView view(window.contentItem());
        view.setSize({328.0, 273.0});
        window.show();
        // Nothing has run but this thread, without its event loop: no driver can be in use yet.
        window.grabWindow();
        QCOMPARE(changes.count(), 0);
        QVERIFY(!isVulkan(view.renderer().device()));
        const QImage byProcessor = view.vexelView().render(1.0);
        QVERIFY(!byProcessor.isNull());

        QTRY_COMPARE(changes.count(), 1);
        QVERIFY(isVulkan(view.renderer().device()));
        QVERIFY(view.renderer().pipelineState());
        QTRY_VERIFY(view.vexelView().render(1.0).cacheKey() != byProcessor.cacheKey());
        QVERIFY(largestDistance(view.vexelView().render(1.0), byProcessor) <= 1);

        const auto failed = view.renderer().device();
        const QImage byVulkan = view.vexelView().render(1.0);
        SystemDevice::instance().abandon(failed);
        QCOMPARE(changes.count(), 2);
        QVERIFY(!isVulkan(view.renderer().device()));
        QTRY_VERIFY(view.vexelView().render(1.0).cacheKey() != byVulkan.cacheKey());
        QCOMPARE(view.vexelView().render(1.0), byProcessor);
        // Given up once, it stays so.
        SystemDevice::instance().abandon(failed);
        QCOMPARE(changes.count(), 2);
    }
};

QTEST_MAIN(SpectrumViewTest)
#include "tst_spectrumview.moc"
