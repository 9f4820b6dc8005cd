#include "service/displaycolor.h"
#include "theme/theme.h"

#include "../shared/table.h"

#include <QSignalSpy>
#include <QTest>

#include <cmath>

using namespace favrin::theme;
using favrin::service::ColorScheme;
using favrin::service::DisplayColor;

namespace {

double luminance(const QColor &color)
{
    const auto linear = [](float value) {
        return value <= 0.04045F ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

QColor over(const QColor &front, const QColor &back)
{
    const float a = front.alphaF();
    const auto mix = [a](float f, float b) { return a * f + (1.0F - a) * b; };
    return QColor::fromRgbF(mix(front.redF(), back.redF()), mix(front.greenF(), back.greenF()),
                            mix(front.blueF(), back.blueF()));
}

/** The ratio of the accessibility guidelines, 1 to 21. */
double contrastRatio(const QColor &front, const QColor &back)
{
    const double one = luminance(over(front, back)) + 0.05;
    const double other = luminance(back) + 0.05;
    return std::max(one, other) / std::min(one, other);
}

} // namespace

class ThemeTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void colorsCanBeReadOnTheBackground_data()
    {
        addRows<ColorScheme, Contrast>({
            {"light", ColorScheme::Light, Contrast::Standard},
            {"dark", ColorScheme::Dark, Contrast::Standard},
            {"light, more contrast", ColorScheme::Light, Contrast::Increased},
            {"dark, more contrast", ColorScheme::Dark, Contrast::Increased},
        });
    }
    void colorsCanBeReadOnTheBackground()
    {
        const auto [scheme, contrast] = row<ColorScheme, Contrast>();
        const SemanticColors colors = semanticColors(scheme, contrast);
        const bool more = contrast == Contrast::Increased;
        const auto ratio = [&colors](const QColor &color) { return contrastRatio(color, colors.systemBackground); };
        QVERIFY(ratio(colors.label) >= 15.0);
        QVERIFY(ratio(colors.secondaryLabel) >= (more ? 7.0 : 4.5));
        QVERIFY(ratio(colors.tint) >= (more ? 7.0 : 4.5));
        QVERIFY(ratio(colors.systemRed) >= (more ? 4.5 : 3.0));
        QVERIFY(ratio(colors.systemGray) >= (more ? 4.5 : 3.0));
        QVERIFY(contrastRatio(colors.secondaryLabel, over(colors.fill, colors.systemBackground)) >= 3.0);
    }

    void textGrowsUpToItsCap_data()
    {
        addRows<int, int, int, int>({
            {"smallest", int(TextSizeCategory::ExtraSmall), 14, 11, 14},
            {"default", int(TextSizeCategory::Large), 17, 13, 17},
            {"cap of bar symbols", int(TextSizeCategory::ExtraLarge), 19, 15, 19},
            {"cap of text", int(TextSizeCategory::ExtraExtraExtraLarge), 23, 19, 19},
            {"largest", int(TextSizeCategory::AccessibilityExtraExtraExtraLarge), 23, 19, 19},
            {"beyond the largest", 400, 23, 19, 19},
            {"below the smallest", -1, 14, 11, 14},
        });
    }
    void textGrowsUpToItsCap()
    {
        const auto [category, headline, footnote, barSymbol] = row<int, int, int, int>();
        Theme &theme = Theme::instance();
        theme.setTextSizeCategory(static_cast<TextSizeCategory>(category));
        QCOMPARE(theme.headlineFont().pixelSize(), headline);
        QCOMPARE(theme.footnoteFont().pixelSize(), footnote);
        QCOMPARE(theme.barSymbolSize(), barSymbol);
        theme.setTextSizeCategory(TextSizeCategory::Large);
    }

    void changesAreToldOnce()
    {
        Theme &theme = Theme::instance();
        QSignalSpy colors(&theme, &Theme::colorsChanged);
        theme.setColorScheme(ColorScheme::Dark);
        theme.setColorScheme(ColorScheme::Dark);
        QCOMPARE(colors.count(), 1);
        QCOMPARE(theme.label(), QColor(Qt::white));
        theme.setIncreaseContrast(true);
        QCOMPARE(colors.count(), 2);
        QCOMPARE(theme.systemBackground(), QColor(Qt::black));
        theme.setIncreaseContrast(false);
        theme.setColorScheme(ColorScheme::Light);
    }

    void colorsFollowTheSurface()
    {
        Theme &theme = Theme::instance();
        const QColor before = theme.tint();
        DisplayColor::instance().setSurfaceColorSpace(favrin::model::SomeColor::ColorSpace::displayP3);
        QVERIFY(theme.tint() != before);
        QCOMPARE(theme.secondaryLabel().alpha(), 0x99);
        DisplayColor::instance().setSurfaceColorSpace(favrin::model::SomeColor::ColorSpace::sRGB);
        QCOMPARE(theme.tint(), before);
    }
};

QTEST_MAIN(ThemeTest)
#include "tst_theme.moc"
