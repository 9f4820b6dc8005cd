#include "grid/swatchpalettes.h"
#include "platform/appearance/darkcounterpart.h"

#include <QTest>

using namespace favrin::grid;
using favrin::model::SomeColor;
using favrin::service::ColorPickerState;
using favrin::service::ColorScheme;

class SwatchPalettesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void defaultPaletteHoldsItsColors()
    {
        // Sums over the whole table: one digit typed wrong anywhere shows here.
        double r = 0.0;
        double g = 0.0;
        double b = 0.0;
        double weighted = 0.0;
        int index = 0;
        for (const auto &row : defaultColorMatrix()) {
            for (const SomeColor &color : row) {
                r += color.r * 255.0;
                g += color.g * 255.0;
                b += color.b * 255.0;
                QVERIFY(color.a == 1.0 && color.colorSpace == SomeColor::ColorSpace::sRGB);
                weighted += ++index * (color.r + 2.0 * color.g + 3.0 * color.b) * 255.0;
            }
        }
        QCOMPARE(qRound(r), 18741);
        QCOMPARE(qRound(g), 15917);
        QCOMPARE(qRound(b), 14117);
        QCOMPARE(qRound(weighted), 6837073);
        QCOMPARE(defaultColorMatrix()[0][5], SomeColor(0.6, 0.6, 0.6, 1.0, SomeColor::ColorSpace::sRGB));
    }

    void darkPaletteIsTheReversedCounterpart()
    {
        using favrin::platform::Appearance;
        for (std::size_t row = 0; row < 10; ++row) {
            for (std::size_t column = 0; column < 12; ++column) {
                const SomeColor &light =
                    row == 0 ? defaultColorMatrix()[0][11 - column] : defaultColorMatrix()[10 - row][column];
                const auto dark = convertColor(light.platformColor(), Appearance::Light, Appearance::Dark);
                QCOMPARE(darkColorMatrix()[row][column], SomeColor(dark, SomeColor::ColorSpace::sRGB));
            }
        }
    }

    void paletteFollowsStateAndEnvironment()
    {
        const auto isDark = [](bool enabled, std::optional<ColorScheme> overriding, ColorScheme environment) {
            ColorPickerState state({});
            state.enableDarkGrid.set(enabled);
            state.overrideColorScheme.set(overriding);
            return &activePalette(state, environment) == &darkColorMatrix();
        };
        QVERIFY(!isDark(false, ColorScheme::Dark, ColorScheme::Dark));
        QVERIFY(!isDark(true, {}, ColorScheme::Light));
        QVERIFY(isDark(true, {}, ColorScheme::Dark));
        QVERIFY(!isDark(true, ColorScheme::Light, ColorScheme::Dark));
        QVERIFY(isDark(true, ColorScheme::Dark, ColorScheme::Light));
    }
};

QTEST_APPLESS_MAIN(SwatchPalettesTest)
#include "tst_swatchpalettes.moc"
