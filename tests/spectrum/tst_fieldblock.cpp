#include "model/somecolor.h"
#include "platform/color/rgbconversion.h"
#include "spectrum/displayp3bytes.h"
#include "spectrum/fieldblock.h"
#include "spectrum/spectrumrenderer.h"

#include <QRgb>
#include <QTest>

#include <cmath>

using namespace favrin;
using model::SomeColor;
using spectrum::DisplayP3Bytes;

namespace {

constexpr std::uint32_t untouched = 0x12345678;

std::vector<float> middles(std::size_t count, float from, float to)
{
    std::vector<float> values;
    for (std::size_t i = 0; i < count; ++i)
        values.push_back(from + (to - from) * (static_cast<float>(i) + 0.5F) / static_cast<float>(count));
    return values;
}

QRgb expectedPixel(float x, float y, SomeColor::ColorSpace space)
{
    const SomeColor color(spectrum::SpectrumRenderer::colorAtLocation({x, y}), space);
    const auto byte = [](double component) { return static_cast<int>(component * 255.0 + 0.5); };
    return qRgb(byte(color.r), byte(color.g), byte(color.b));
}

int distance(QRgb left, QRgb right)
{
    return std::max({std::abs(qRed(left) - qRed(right)), std::abs(qGreen(left) - qGreen(right)),
                     std::abs(qBlue(left) - qBlue(right)), std::abs(qAlpha(left) - qAlpha(right))});
}

} // namespace

class FieldBlockTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void everyPixelIsTheMappings_data()
    {
        QTest::addColumn<std::size_t>("width");
        QTest::addColumn<std::size_t>("height");
        QTest::addColumn<SomeColor::ColorSpace>("space");
        const std::array<std::pair<std::size_t, std::size_t>, 10> sizes = {
            {{0, 3}, {1, 1}, {2, 6}, {63, 7}, {64, 12}, {65, 13}, {127, 5}, {128, 2}, {129, 600}, {1080, 900}}};
        for (const auto &[width, height] : sizes) {
            for (const auto space : {SomeColor::ColorSpace::sRGB, SomeColor::ColorSpace::displayP3}) {
                QTest::addRow("%zu x %zu %s", width, height,
                              space == SomeColor::ColorSpace::sRGB ? "sRGB" : "Display P3")
                    << width << height << space;
            }
        }
    }

    void everyPixelIsTheMappings()
    {
        QFETCH(std::size_t, width);
        QFETCH(std::size_t, height);
        QFETCH(SomeColor::ColorSpace, space);
        const auto columns = middles(width, -1.0F, 1.0F);
        const auto rows = middles(height, 1.0F, -1.0F);
        constexpr std::size_t margin = 3;
        const std::size_t stride = width + margin;
        std::vector<std::uint32_t> pixels(stride * height, untouched);
        const auto fill =
            space == SomeColor::ColorSpace::sRGB ? spectrum::fillWithField : spectrum::fillWithFieldInDisplayP3;
        fill({.columns = columns,
              .rows = rows,
              .pixels = pixels.data(),
              .rowStride = static_cast<std::ptrdiff_t>(stride)});
        std::size_t different = 0;
        for (std::size_t y = 0; y < height; ++y) {
            for (std::size_t x = 0; x < width; ++x) {
                const int steps = distance(pixels[y * stride + x], expectedPixel(columns[x], rows[y], space));
                QVERIFY2(steps <= 1, qPrintable(QStringLiteral("(%1, %2): %3").arg(x).arg(y).arg(steps)));
                different += static_cast<std::size_t>(steps);
            }
            for (std::size_t x = width; x < stride; ++x)
                QCOMPARE(pixels[y * stride + x], untouched);
        }
        // In single precision a component may fall on the other side of where two bytes meet.
        QVERIFY2(different <= 1 + width * height / 10000, qPrintable(QString::number(different)));
    }

    void lightIsThatOfTheCurve()
    {
        constexpr int count = 100000;
        for (int i = 0; i <= count; ++i) {
            const float component = static_cast<float>(i) / count;
            const double error = DisplayP3Bytes::light(component) - platform::decodedSRGB(component);
            QVERIFY2(std::abs(error) <= 6e-7, qPrintable(QStringLiteral("%1: %2").arg(component).arg(error)));
        }
    }

    void bytesChangeWhereTheyShould()
    {
        const auto &bytes = DisplayP3Bytes::instance();
        const auto byteAt = [&bytes](double place) { return bytes.byteInBits16(static_cast<float>(place)) >> 16U; };
        constexpr double zero = DisplayP3Bytes::lightZero;
        QCOMPARE(byteAt(zero), 0U);
        QCOMPARE(byteAt(zero + 1.0), 255U);
        QCOMPARE(byteAt(zero + 1.000001), 255U);
        for (std::uint32_t byte = 1; byte <= 255; ++byte) {
            const double change = zero + platform::decodedSRGB((byte - 0.5) / 255.0);
            const double unit = change * std::numeric_limits<float>::epsilon();
            QCOMPARE(byteAt(change - unit), byte - 1);
            QCOMPARE(byteAt(change + unit), byte);
            QCOMPARE(byteAt(zero + platform::decodedSRGB(byte / 255.0)), byte);
        }
    }
};

QTEST_APPLESS_MAIN(FieldBlockTest)
#include "tst_fieldblock.moc"
