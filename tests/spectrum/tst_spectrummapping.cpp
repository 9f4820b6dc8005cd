#include "spectrum/hue.h"
#include "spectrum/spectrummapping.h"
#include "spectrum/spectrumrenderer.h"
#include "spectrum/timingcurve.h"

#include <QTest>

#include <bit>
#include <cmath>
#include <limits>

using namespace favrin;
using namespace favrin::spectrum;
using model::SomeColor;

namespace {

constexpr float notANumber = std::numeric_limits<float>::quiet_NaN();
constexpr double anyTolerance = 1e-5;

FieldColor colorAt(double x, double y)
{
    const platform::Color color = SpectrumRenderer::colorAtLocation({x, y});
    const auto components = color.components();
    return {static_cast<float>(components[0]), static_cast<float>(components[1]), static_cast<float>(components[2]),
            static_cast<float>(color.alpha())};
}

bool isNear(double left, double right, double tolerance)
{
    return std::abs(left - right) <= tolerance;
}

bool isNear(const FieldColor &left, const FieldColor &right)
{
    return isNear(left.r, right.r, anyTolerance) && isNear(left.g, right.g, anyTolerance) &&
           isNear(left.b, right.b, anyTolerance) && left.a == right.a;
}

SomeColor sRGB(double r, double g, double b)
{
    return {r, g, b, 1.0, SomeColor::ColorSpace::sRGB};
}

/** A hash of the bits of the field at many places: one changed bit anywhere changes it. */
quint64 bitsOfTheField()
{
    quint64 hash = 14695981039346656037ULL;
    const auto feed = [&hash](float value) { hash = (hash ^ std::bit_cast<quint32>(value)) * 1099511628211ULL; };
    for (int row = 0; row <= 200; ++row) {
        for (int column = 0; column <= 200; ++column) {
            const FieldColor color = colorAt(column / 100.0 - 1.0, row / 100.0 - 1.0);
            for (const float component : {color.r, color.g, color.b})
                feed(component);
        }
    }
    return hash;
}

} // namespace

class SpectrumMappingTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void locationHasColor()
    {
        QVERIFY(isNear(colorAt(0.0, 1.0), {1.0F, 0.0F, 0.0F}));
        QVERIFY(isNear(colorAt(0.0, 0.0), {0.0F, 1.0F, 1.0F}));
        // The other end of the hues is almost red.
        QVERIFY(isNear(colorAt(0.0, -1.0), {1.0F, 0.0F, 1.0F / 255.0F}));
        QVERIFY(isNear(colorAt(0.0, 0.5), {0.40900F, 1.0F, 0.0F}));
        QVERIFY(isNear(colorAt(0.0, -0.5), {0.40900F, 0.0F, 1.0F}));
        // A tint, a shade, and the pure hue between.
        QVERIFY(isNear(colorAt(-0.5, 1.0), {1.0F, 0.60036F, 0.60036F}));
        QVERIFY(isNear(colorAt(0.5, 1.0), {0.60036F, 0.0F, 0.0F}));
        QVERIFY(isNear(colorAt(-0.0, 1.0), {1.0F, 0.0F, 0.0F}));
    }

    void fieldKeepsItsBits()
    {
        // Taken from these very operations computed one by one in single precision by another program.
        QCOMPARE(bitsOfTheField(), quint64(0x742dad70c90f4462));
    }

    void angleOfColor()
    {
        QCOMPARE(hueAngle(1.0F, 0.0F, 0.0F), 0.0F);
        QCOMPARE(hueAngle(1.0F, 1.0F, 0.0F), 60.0F);
        QCOMPARE(hueAngle(0.0F, 0.5F, 0.0F), 120.0F);
        QCOMPARE(hueAngle(0.0F, 1.0F, 1.0F), 180.0F);
        QCOMPARE(hueAngle(0.5F, 0.5F, 1.0F), 240.0F);
        QCOMPARE(hueAngle(1.0F, 0.0F, 1.0F), 300.0F);
        QVERIFY(std::isnan(hueAngle(0.5F, 0.5F, 0.5F)));
        QCOMPARE(hueAngle(notANumber, notANumber, notANumber), 0.0F);
    }

    void positionOfColor()
    {
        const auto position = [](const FieldColor &color) {
            return QPointF(SpectrumRenderer::positionForColor(color));
        };
        const auto isExactly = [](QPointF place, double x, double y) { return place.x() == x && place.y() == y; };
        // Red is found just before the top; opacity is not looked at.
        QVERIFY(isExactly(position({1.0F, 0.0F, 0.0F}), 0.0, 0.9990234375));
        QVERIFY(isExactly(position({1.0F, 0.0F, 0.0F, 0.0F}), 0.0, 0.9990234375));
        // A full component makes a tint.
        QVERIFY(isExactly(position({0.0F, 1.0F, 1.0F}), 0.0, 0.0));
        QVERIFY(isExactly(position({1.0F, 1.0F, 1.0F}), -1.0, -1.0));
        const QPointF black = position({0.0F, 0.0F, 0.0F});
        QVERIFY(isNear(black.x(), 1.0, 1e-5) && isNear(black.y(), 0.9990234375, 1e-5));
        const QPointF gray = position({0.5F, 0.5F, 0.5F});
        QVERIFY(isNear(gray.x(), 0.5794, 5e-5) && isNear(gray.y(), -1.0, 5e-5));
    }

    void positionLeadsBack()
    {
        // Away from the edges, where a color is one place only and its hue can be told.
        for (int row = -98; row <= 98; ++row) {
            for (int column = -90; column <= 90; ++column) {
                const QPointF location(column / 100.0, row / 100.0);
                const QPointF back = SpectrumRenderer::positionForColor(colorAt(location.x(), location.y()));
                const FieldColor there = colorAt(location.x(), location.y());
                const FieldColor here = colorAt(back.x(), back.y());
                const bool same =
                    isNear(here.r, there.r, 2e-4) && isNear(here.g, there.g, 2e-4) && isNear(here.b, there.b, 2e-4);
                QVERIFY2(same && isNear(back.x(), location.x(), 1e-3) && isNear(back.y(), location.y(), 4e-3),
                         qPrintable(QStringLiteral("%1,%2 %3,%4")
                                        .arg(location.x())
                                        .arg(location.y())
                                        .arg(back.x(), 0, 'g', 9)
                                        .arg(back.y(), 0, 'g', 9)));
            }
        }
    }

    void curveLeadsBack()
    {
        const TimingCurve curve(0.42F, 0.1F, 0.83F, 0.95F);
        float previous = -1.0F;
        for (int i = 0; i <= 1000; ++i) {
            const float x = static_cast<float>(i) / 1000.0F;
            const float y = curve.y(x);
            QVERIFY(y > previous);
            QVERIFY(isNear(curve.x(y), x, 1e-4));
            previous = y;
        }
        QVERIFY(isNear(curve.y(0.5F), 0.39964, 1e-5));
    }

    void curveEndsForAnyInput()
    {
        // The first has a vertical start, where Newton's method has nothing to divide by.
        for (const TimingCurve &curve : {TimingCurve(0.0F, 0.5F, 1.0F, 0.5F), TimingCurve(0.47F, 0.0F, 0.68F, 1.0F)}) {
            QVERIFY(std::isnan(curve.y(notANumber)));
            QCOMPARE(curve.y(0.0F), 0.0F);
            for (const float x : {-1e30F, -2.0F, 0.001F, 0.999F, 2.0F, 1e30F, std::numeric_limits<float>::infinity()})
                curve.x(curve.y(x));
            for (int i = 1; i < 1000; ++i)
                QVERIFY(curve.y(static_cast<float>(i) / 1000.0F) >=
                        curve.y(static_cast<float>(i - 1) / 1000.0F) - 1e-4F);
        }
    }

    void pointHasColor()
    {
        const auto means = [](QPointF point, QPointF location) {
            return locationForPoint(point, {360.0, 300.0}) == location &&
                   colorForPoint(point, {360.0, 300.0}) == SpectrumRenderer::colorAtLocation(location);
        };
        QVERIFY(means({0.0, 0.0}, {-1.0, 1.0}));
        QVERIFY(means({180.0, 150.0}, {0.0, 0.0}));
        QVERIFY(means({360.0, 300.0}, {1.0, -1.0}));
        QVERIFY(means({-50.0, 75.0}, {-1.0, 0.5}));
        QVERIFY(means({1e300, -1e300}, {1.0, 1.0}));
    }

    void colorHasPoint()
    {
        const auto hasPoint = [](const SomeColor &color) { return pointForColor(color, {360.0, 300.0}).has_value(); };
        QVERIFY(hasPoint(sRGB(1.0, 0.6, 0.6)));
        QVERIFY(hasPoint(sRGB(0.6, 0.0, 0.0)));
        // Clipped by sRGB.
        QVERIFY(hasPoint(SomeColor(1.0, 0.0, 0.0, 1.0, SomeColor::ColorSpace::displayP3)));
        QVERIFY(!hasPoint(sRGB(0.5, 0.5, 0.5)));
        QVERIFY(!hasPoint(sRGB(0.7, 0.4, 0.2)));
        // White, black, and what is almost so.
        QVERIFY(!hasPoint(sRGB(1.0, 1.0, 1.0)));
        QVERIFY(!hasPoint(sRGB(0.9991, 0.9991, 0.9991)));
        QVERIFY(!hasPoint(sRGB(0.0, 0.0, 0.0)));
        QVERIFY(!hasPoint(sRGB(0.0009, 0.0, 0.0)));
        // At the tolerance.
        QVERIFY(!hasPoint(sRGB(0.001, 0.4, 0.2)));
        QVERIFY(!hasPoint(sRGB(0.999, 0.4, 0.2)));
    }

    void pointsAreInTheView()
    {
        const QSizeF size(360.0, 300.0);
        const auto tint = pointForColor(sRGB(1.0, 0.6, 0.6), size);
        QVERIFY(isNear(tint->x(), 90.0, 0.1) && isNear(tint->y(), 0.0, 0.2));
        const auto shade = pointForColor(sRGB(0.6, 0.0, 0.0), size);
        QVERIFY(isNear(shade->x(), 270.0, 0.1) && isNear(shade->y(), 0.0, 0.2));
        const auto blue = pointForColor(sRGB(0.0, 0.0, 1.0), size);
        QVERIFY(isNear(blue->x(), 180.0, 0.1) && isNear(blue->y(), 200.0, 0.2));
    }
};

QTEST_GUILESS_MAIN(SpectrumMappingTest)
#include "tst_spectrummapping.moc"
