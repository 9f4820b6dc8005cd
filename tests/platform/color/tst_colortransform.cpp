#include "platform/color/color.h"
#include "platform/color/primaries.h"
#include "platform/color/rgbconversion.h"

#include "../../shared/table.h"

#include <QTest>

#include <cmath>
#include <limits>
#include <vector>

using namespace favrin::platform;

namespace {

constexpr double infinity = std::numeric_limits<double>::infinity();

std::optional<Triple> convert(const ColorSpace &space, std::vector<double> components, std::string_view target)
{
    return ColorTransform::into(target)->convert(Color(space, components, 1.0), RenderingIntent::Perceptual);
}

bool isNear(const Triple &left, const Triple &right, double tolerance)
{
    for (std::size_t i = 0; i < 3; ++i) {
        if (!(std::abs(left[i] - right[i]) <= tolerance))
            return false;
    }
    return true;
}

double squared(double encoded, double)
{
    return encoded * encoded;
}

// The space with the primaries of sRGB, red and blue exchanged, on a square curve.
ColorSpace exchangedSpace(double parameter = 0.0)
{
    return ColorSpace::unnamed({{{0, 0, 1}, {0, 1, 0}, {1, 0, 0}}}, squared, parameter);
}

} // namespace

class ColorTransformTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void converts_data()
    {
        using List = std::vector<double>;
        const auto sRGB = ColorSpace::sRGB();
        const auto p3 = ColorSpace::displayP3();
        addRows<ColorSpace, std::vector<double>, bool, std::vector<double>, double>({
            {"sRGB blue", sRGB, List{0, 97 / 255.0, 253 / 255.0}, true, List{40 / 255.0, 95.45 / 255.0, 243.8 / 255.0},
             0.0002},
            {"sRGB red", sRGB, List{1, 0, 0}, true, List{0.9175, 0.2003, 0.1386}, 0.0001},
            {"P3 red is clipped", p3, List{1, 0, 0}, false, List{1, 0, 0}, 0.0},
            {"P3 green is clipped", p3, List{0, 1, 0}, false, List{0, 1, 0}, 0.0},
            {"white", p3, List{1, 1, 1}, false, List{1, 1, 1}, 0.0},
            {"same space, only clipped", sRGB, List{0.1, 1.5, -0.5}, false, List{0.1, 1, 0}, 0.0},
            {"same space, untouched", p3, List{0.1, 0.2, 0.3}, true, List{0.1, 0.2, 0.3}, 0.0},
            {"gray", ColorSpace::gray(), List{0.3}, false, List{0.3, 0.3, 0.3}, 0.0},
            {"gray into P3", ColorSpace::gray(), List{0.3}, true, List{0.3, 0.3, 0.3}, 0.0},
            {"extended into sRGB", ColorSpace::extendedSRGB(), List{-0.4, 0.5, 1.4}, false, List{0, 0.5, 1}, 0.0},
            // Pure P3 red, green and blue as they are written in extended sRGB; wrong unless the curve is odd.
            {"extended red into P3", ColorSpace::extendedSRGB(), List{1.0930, -0.2267, -0.1501}, true, List{1, 0, 0},
             0.004},
            {"extended green into P3", ColorSpace::extendedSRGB(), List{-0.5116, 1.0183, -0.3107}, true, List{0, 1, 0},
             0.004},
            {"linear", ColorSpace::linearSRGB(), List{0.214041, 0.0, 1.0}, false, List{0.5, 0, 1}, 0.0001},
            {"unnamed", exchangedSpace(), List{0.0, 0.0, std::sqrt(0.214041)}, false, List{0.5, 0, 0}, 0.0001},
        });
    }
    void converts()
    {
        const auto [space, components, intoDisplayP3, expected, tolerance] =
            row<ColorSpace, std::vector<double>, bool, std::vector<double>, double>();
        const auto target = intoDisplayP3 ? colorspacename::displayP3 : colorspacename::sRGB;
        const auto result = convert(space, components, target);
        QVERIFY(result.has_value());
        const QString text = QStringLiteral("%1 %2 %3").arg((*result)[0]).arg((*result)[1]).arg((*result)[2]);
        QVERIFY2(isNear(*result, {expected[0], expected[1], expected[2]}, tolerance), qPrintable(text));
    }

    void publishedMatricesAreMet()
    {
        const auto column = [](auto convertLinear, std::size_t i) {
            Triple unit = {};
            unit[i] = 1.0;
            return convertLinear(unit);
        };
        QVERIFY(isNear(column(linearDisplayP3ToLinearSRGB, 0), {1.224940, -0.042057, -0.019638}, 1e-6));
        QVERIFY(isNear(column(linearDisplayP3ToLinearSRGB, 1), {-0.224940, 1.042057, -0.078636}, 1e-6));
        QVERIFY(isNear(column(linearDisplayP3ToLinearSRGB, 2), {0.0, 0.0, 1.098274}, 1e-6));
        QVERIFY(isNear(column(linearSRGBToLinearDisplayP3, 0), {0.822462, 0.033194, 0.017083}, 1e-6));
        QVERIFY(isNear(column(linearSRGBToLinearDisplayP3, 1), {0.177538, 0.966806, 0.072397}, 1e-6));
        QVERIFY(isNear(column(linearSRGBToLinearDisplayP3, 2), {0.0, 0.0, 0.910520}, 1e-6));
    }

    void roundTripsKeepInnerColors()
    {
        for (int i = 0; i < 17 * 17 * 17; ++i) {
            const Triple color = {i % 17 / 16.0, i / 17 % 17 / 16.0, i / 289 / 16.0};
            QVERIFY(isNear(convertedDisplayP3ToSRGB(convertedSRGBToDisplayP3(color)), color, 2e-14));
        }
    }

    void neutralsStayNeutral()
    {
        for (int i = 0; i <= 255; ++i) {
            const double gray = i / 255.0;
            for (const Triple &result :
                 {convertedSRGBToDisplayP3({gray, gray, gray}), convertedDisplayP3ToSRGB({gray, gray, gray})}) {
                QVERIFY(result[0] == result[1] && result[1] == result[2]);
                QVERIFY(std::abs(result[0] - gray) < 1e-15);
            }
        }
    }

    void tintsOfDisplayP3ComeBackFull()
    {
        for (int i = 0; i <= 1000; ++i) {
            const Triple tint = {1.0, i / 1000.0, i * i / 1e6};
            const Triple back = convertedDisplayP3ToSRGB(convertedSRGBToDisplayP3(tint));
            QCOMPARE(static_cast<float>(back[0]), 1.0F);
        }
    }

    void hasNoResult_data()
    {
        addRows<double>({
            {"not a number", std::numeric_limits<double>::quiet_NaN()},
            {"infinite", infinity},
            {"minus infinite", -infinity},
        });
    }
    void hasNoResult()
    {
        const auto [component] = row<double>();
        QVERIFY(!ColorTransform::into(colorspacename::gray));
        for (const auto target : {colorspacename::sRGB, colorspacename::displayP3, colorspacename::linearSRGB}) {
            QVERIFY(!convert(ColorSpace::displayP3(), {0.5, component, 0.5}, target));
            const Triple components = {0.5, 0.5, 0.5};
            QVERIFY(!ColorTransform::into(target)->convert(Color(std::nullopt, components, 1.0),
                                                           RenderingIntent::Perceptual));
        }
    }

    void colorKeepsWhatItIsGiven()
    {
        const std::vector<double> components = {-0.0, 7.5, 0.1, 0.9};
        const Color color(ColorSpace::sRGB(), components, 2.0);
        QCOMPARE(color.components().size(), std::size_t(3));
        QVERIFY(std::signbit(color.components()[0]));
        QCOMPARE(color.components()[1], 7.5);
        QCOMPARE(color.alpha(), 2.0);
        QCOMPARE(Color(ColorSpace::gray(), components, 1.0).components().size(), std::size_t(1));
        QCOMPARE(Color(ColorSpace::sRGB(), std::span(components).first(1), 1.0).components()[2], 0.0);
        QVERIFY(!(color == Color(ColorSpace::displayP3(), components, 2.0)));
        QVERIFY(Color::black() == Color(ColorSpace::gray(), std::vector<double>{0.0}, 1.0));
    }

    void spacesAreFoundByName()
    {
        using namespace colorspacename;
        for (const auto name : {sRGB, displayP3, extendedSRGB, linearSRGB, gray}) {
            const auto space = ColorSpace::named(name);
            QVERIFY(space.has_value());
            QCOMPARE(space->name(), std::string(name));
        }
        QVERIFY(!ColorSpace::named("").has_value());
        QVERIFY(!exchangedSpace().name().has_value());
        QVERIFY(exchangedSpace(1.0) == exchangedSpace(1.0));
        QVERIFY(!(exchangedSpace(1.0) == exchangedSpace(2.0)));
    }
};

QTEST_APPLESS_MAIN(ColorTransformTest)
#include "tst_colortransform.moc"
