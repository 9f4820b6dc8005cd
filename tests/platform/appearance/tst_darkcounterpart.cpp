#include "platform/appearance/darkcounterpart.h"
#include "platform/appearance/oklab.h"
#include "platform/color/rgbconversion.h"

#include <QtTest>

#include <cmath>
#include <numbers>

using namespace favrin::platform;

namespace {

Triple dark(const Triple &light)
{
    const auto color = convertColor(Color(ColorSpace::sRGB(), light, 1.0), Appearance::Light, Appearance::Dark);
    const auto components = color.components();
    return {components[0], components[1], components[2]};
}

Triple linear(const Triple &encoded)
{
    return {decodedSRGB(encoded[0]), decodedSRGB(encoded[1]), decodedSRGB(encoded[2])};
}

OkLch perceived(const Triple &encoded)
{
    return oklchOf(linear(encoded));
}

double hueDifference(const OkLch &one, const OkLch &other)
{
    return std::abs(std::remainder(one.hue - other.hue, 2.0 * std::numbers::pi)) * 180.0 / std::numbers::pi;
}

/** Perceived difference; 0.02 is just visible between areas that touch. */
double difference(const Triple &one, const Triple &other)
{
    const auto a = perceived(one);
    const auto b = perceived(other);
    return std::hypot(a.lightness - b.lightness, a.chroma * std::cos(a.hue) - b.chroma * std::cos(b.hue),
                      a.chroma * std::sin(a.hue) - b.chroma * std::sin(b.hue));
}

/** All colors of a lattice in sRGB. */
std::vector<Triple> lattice(int steps)
{
    std::vector<Triple> colors;
    for (int red = 0; red <= steps; ++red) {
        for (int green = 0; green <= steps; ++green) {
            for (int blue = 0; blue <= steps; ++blue)
                colors.push_back({double(red) / steps, double(green) / steps, double(blue) / steps});
        }
    }
    return colors;
}

QByteArray described(const Triple &color)
{
    return QByteArray::number(color[0]) + ' ' + QByteArray::number(color[1]) + ' ' + QByteArray::number(color[2]);
}

} // namespace

/** What a designer may rely on when colors move to a dark background. */
class DarkCounterpartTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void graysStayNeutralInOrderBetweenBlackAndWhite()
    {
        QCOMPARE(dark({0, 0, 0}), (Triple{0, 0, 0}));
        QCOMPARE(dark({1, 1, 1}), (Triple{1, 1, 1}));
        double previous = 0.0;
        for (int level = 1; level <= 255; ++level) {
            const double value = level / 255.0;
            const auto gray = dark({value, value, value});
            QCOMPARE(gray, (Triple{gray[0], gray[0], gray[0]}));
            QVERIFY(gray[0] > previous);
            previous = gray[0];
        }
    }

    void colorsStayRecognisable()
    {
        const auto background = perceived({0x1C / 255.0, 0x1C / 255.0, 0x1E / 255.0});
        for (const auto &light : lattice(10)) {
            const auto result = dark(light);
            const auto before = perceived(light);
            const auto after = perceived(result);
            for (const double component : result)
                QVERIFY2(component >= 0.0 && component <= 1.0, described(light).constData());
            if (before.chroma > 0.02)
                QVERIFY2(hueDifference(before, after) < 1.0, described(light).constData());
            QVERIFY2(difference(light, result) < 0.15, described(light).constData());
            // What was darker than the background by nature rises from it, black alone excepted.
            if (before.lightness > 0.13)
                QVERIFY2(after.lightness > background.lightness, described(light).constData());
        }
    }

    void theOrderOfLightnessIsKeptAlongAHue()
    {
        for (int degree = 0; degree < 360; degree += 15) {
            double previous = -1.0;
            for (int step = 0; step <= 50; ++step) {
                const double lightness = step / 50.0;
                const double hue = degree * std::numbers::pi / 180.0;
                auto light = linearOf({lightness, 0.7 * largestChroma(lightness, hue), hue});
                std::transform(light.begin(), light.end(), light.begin(), encodedSRGB);
                const double after = perceived(dark(light)).lightness;
                QVERIFY(after > previous);
                previous = after;
            }
        }
    }

    void colorsThatAreEasyToTellApartStaySo()
    {
        const auto colors = lattice(6);
        std::vector<Triple> results;
        std::transform(colors.begin(), colors.end(), std::back_inserter(results), dark);
        for (std::size_t one = 0; one < colors.size(); ++one) {
            for (std::size_t other = 0; other < one; ++other) {
                const double before = difference(colors[one], colors[other]);
                const double after = difference(results[one], results[other]);
                if (before < 0.03)
                    continue;
                QVERIFY2(after > 0.25 * before,
                         (described(colors[one]) + " and " + described(colors[other])).constData());
            }
        }
    }

    void closeColorsStayClose()
    {
        constexpr double step = 1.0 / 255.0;
        for (const auto &color : lattice(12)) {
            for (std::size_t channel = 0; channel < 3; ++channel) {
                auto neighbour = color;
                neighbour[channel] += color[channel] < 0.5 ? step : -step;
                const double before = difference(color, neighbour);
                const double after = difference(dark(color), dark(neighbour));
                QVERIFY2(after < 2.5 * before + 0.015, described(color).constData());
            }
        }
    }

    void onlyLightColorsBecomeDarkOnes()
    {
        using enum Appearance;
        const Triple components = {0.1, 0.2, 0.9};
        const Color color(ColorSpace::sRGB(), components, 0.25);
        for (const auto &[source, target] : {std::pair(Dark, Light), {Light, Light}, {Dark, Dark}})
            QVERIFY(convertColor(color, source, target) == color);
        const Color spaceless(std::nullopt, components, 0.25);
        QVERIFY(convertColor(spaceless, Light, Dark) == spaceless);
        const auto wide = convertColor(Color(ColorSpace::displayP3(), components, 0.25), Light, Dark);
        QVERIFY(wide.colorSpace() == ColorSpace::sRGB() && wide.alpha() == 0.25);
        const auto broken = convertColor(Color(ColorSpace::sRGB(), Triple{qQNaN(), 0.2, 0.9}, 0.25), Light, Dark);
        QVERIFY(std::isnan(broken.components()[0]) && broken.components()[2] == 0.9);
    }
};

QTEST_APPLESS_MAIN(DarkCounterpartTest)
#include "tst_darkcounterpart.moc"
