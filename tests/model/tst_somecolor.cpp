#include "model/somecolor.h"

#include "../shared/table.h"
#include "platform/color/displaygamut.h"

#include <QTest>

#include <bit>
#include <cmath>
#include <cstdint>
#include <limits>
#include <vector>

using namespace favrin;
using model::SomeColor;
using Space = model::SomeColor::ColorSpace;
using Component = model::SomeColor::Component;

namespace {

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

bool isSameBits(const SomeColor &left, const SomeColor &right)
{
    for (const Component component : {Component::r, Component::g, Component::b, Component::a}) {
        if (std::bit_cast<std::uint64_t>(left[component]) != std::bit_cast<std::uint64_t>(right[component]))
            return false;
    }
    return left.colorSpace == right.colorSpace;
}

std::size_t hashOf(const SomeColor &color)
{
    return std::hash<SomeColor>{}(color);
}

} // namespace

class SomeColorTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void sameSpaceIsUntouched()
    {
        for (const Space space : model::allColorSpaces) {
            const SomeColor odd(-0.0, 7.25, notANumber, -3.0, space);
            QVERIFY(isSameBits(odd.converted(space), odd));
        }
        const SomeColor plain(0.1, 0.2, 0.3, 0.25, Space::displayP3);
        QVERIFY(isSameBits(SomeColor(plain.platformColor()), plain));
    }

    // The short road without platform objects must end in the very bits of the long one.
    void convertsAsThePlatformDoes()
    {
        for (int i = 0; i < 9 * 9 * 9; ++i) {
            for (const Space space : model::allColorSpaces) {
                const Space target = space == Space::sRGB ? Space::displayP3 : Space::sRGB;
                const SomeColor color(i % 9 / 7.0 - 0.1, i / 9 % 9 / 7.0 - 0.1, i / 81 / 7.0 - 0.1, 0.25, space);
                const SomeColor converted = color.converted(target);
                QVERIFY(isSameBits(converted, SomeColor(color.platformColor(), target)));
                QCOMPARE(converted.a, 0.25);
            }
        }
    }

    void unconvertibleIsBlack()
    {
        const std::vector<double> components = {0.5, 0.5, 0.5};
        const SomeColor black(0.0, 0.0, 0.0, 0.25, Space::sRGB);
        QCOMPARE(SomeColor(0.5, notANumber, 0.5, 0.25, Space::displayP3).inSRGB(), black);
        QCOMPARE(SomeColor(0.5, HUGE_VAL, 0.5, 0.25, Space::displayP3).inSRGB(), black);
        QCOMPARE(SomeColor(platform::Color(std::nullopt, components, 0.25), Space::sRGB), black);
    }

    void takesTheSpaceOfThePlatformColor()
    {
        // Asked for the first time here, and once for the whole process.
        platform::setDisplayGamut(platform::DisplayGamut::P3);
        const std::vector<double> white = {0.5};
        const std::vector<double> rgb = {0.5, 1.5, -0.25};
        const SomeColor gray(platform::Color(platform::ColorSpace::gray(), white, 0.75));
        QCOMPARE(gray, SomeColor(0.5, 0.5, 0.5, 0.75, Space::displayP3));
        QCOMPARE(SomeColor(platform::Color(platform::ColorSpace::extendedSRGB(), rgb, 1.0)).colorSpace,
                 Space::displayP3);
        QCOMPARE(SomeColor(platform::Color(platform::ColorSpace::sRGB(), rgb, 1.0)),
                 SomeColor(0.5, 1.0, 0.0, 1.0, Space::sRGB));
        QCOMPARE(SomeColor(platform::Color(std::nullopt, rgb, 0.5)), SomeColor(0, 0, 0, 0.5, Space::displayP3));
        platform::setDisplayGamut(platform::DisplayGamut::SRGB);
        QCOMPARE(model::deviceDefaultColorSpace(), Space::displayP3);
    }

    void comparesTolerantly_data()
    {
        addRows<SomeColor, bool, bool>({
            {"near", SomeColor(0.0009, -0.0009, 0.0009, 0.0009, Space::sRGB), true, true},
            {"at the tolerance", SomeColor(0.0, 0.0, 0.001, 0.0, Space::sRGB), false, false},
            {"alpha at the tolerance", SomeColor(0.0, 0.0, 0.0, 0.001, Space::sRGB), false, true},
            {"far alpha", SomeColor(0.0, 0.0, 0.0, 1.0, Space::sRGB), false, true},
            {"another space", SomeColor(0.0, 0.0, 0.0, 0.0, Space::displayP3), false, false},
            {"not a number", SomeColor(notANumber, 0.0, 0.0, 0.0, Space::sRGB), false, false},
        });
    }
    void comparesTolerantly()
    {
        const auto [other, isNear, isNearWithoutAlpha] = row<SomeColor, bool, bool>();
        const SomeColor zero(0.0, 0.0, 0.0, 0.0, Space::sRGB);
        QCOMPARE(zero.isApproximatelyEqual(other), isNear);
        QCOMPARE(other.isApproximatelyEqual(zero), isNear);
        QCOMPARE(zero.isApproximatelyEqual(other, false), isNearWithoutAlpha);
    }

    void equalsAndHashesExactly()
    {
        const SomeColor color(0.1, 0.2, 0.0, 1.0, Space::sRGB);
        QVERIFY(color != color.setting(Component::r, std::nextafter(0.1, 1.0)));
        QVERIFY(color != SomeColor(0.1, 0.2, 0.0, 1.0, Space::displayP3));
        QCOMPARE(color, color.setting(Component::b, -0.0));
        QCOMPARE(hashOf(color), hashOf(color.setting(Component::b, -0.0)));
        QVERIFY(hashOf(color) != hashOf(SomeColor(0.2, 0.1, 0.0, 1.0, Space::sRGB)));
        QVERIFY(hashOf(color) != hashOf(SomeColor(0.1, 0.2, 0.0, 1.0, Space::displayP3)));
    }
};

QTEST_APPLESS_MAIN(SomeColorTest)
#include "tst_somecolor.moc"
