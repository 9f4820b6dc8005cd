#include "grid/swatchpalettes.h"
#include "platform/appearance/darkcounterpart.h"

#include <QTest>

using namespace favrin::grid;
using favrin::model::SomeColor;
using favrin::service::ColorPickerState;
using favrin::service::ColorScheme;

using OptionalScheme = std::optional<ColorScheme>;
Q_DECLARE_METATYPE(OptionalScheme)
Q_DECLARE_METATYPE(favrin::service::ColorScheme)

class SwatchPalettesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void defaultPaletteHoldsItsColors();
    void darkPaletteIsTheReversedCounterpart();
    void paletteFollowsStateAndEnvironment_data();
    void paletteFollowsStateAndEnvironment();
};

void SwatchPalettesTest::defaultPaletteHoldsItsColors()
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

void SwatchPalettesTest::darkPaletteIsTheReversedCounterpart()
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

void SwatchPalettesTest::paletteFollowsStateAndEnvironment_data()
{
    QTest::addColumn<bool>("enabled");
    QTest::addColumn<OptionalScheme>("overriding");
    QTest::addColumn<ColorScheme>("environment");
    QTest::addColumn<bool>("dark");
    QTest::newRow("not enabled, all dark") << false << OptionalScheme(ColorScheme::Dark) << ColorScheme::Dark << false;
    QTest::newRow("environment light") << true << OptionalScheme() << ColorScheme::Light << false;
    QTest::newRow("environment dark") << true << OptionalScheme() << ColorScheme::Dark << true;
    QTest::newRow("forced light") << true << OptionalScheme(ColorScheme::Light) << ColorScheme::Dark << false;
    QTest::newRow("forced dark") << true << OptionalScheme(ColorScheme::Dark) << ColorScheme::Light << true;
}

void SwatchPalettesTest::paletteFollowsStateAndEnvironment()
{
    QFETCH(bool, enabled);
    QFETCH(OptionalScheme, overriding);
    QFETCH(ColorScheme, environment);
    QFETCH(bool, dark);
    ColorPickerState state({});
    state.enableDarkGrid.set(enabled);
    state.overrideColorScheme.set(overriding);
    QCOMPARE(&activePalette(state, environment), dark ? &darkColorMatrix() : &defaultColorMatrix());
}

QTEST_APPLESS_MAIN(SwatchPalettesTest)
#include "tst_swatchpalettes.moc"
