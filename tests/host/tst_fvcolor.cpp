#include "host/fvcolor.h"

#include "../shared/table.h"

#include <QTest>

#include <limits>

using namespace Qt::StringLiterals;

/** The public color against Qt's colors and color spaces. */
class FVColorTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void numbersAreKeptAndNonsenseIsNoColor()
    {
        const FVColor odd(0.1 + 0.2, -0.25, 7, 0.5, u"kTQColorSpaceExtendedSRGB"_s);
        QVERIFY(odd.isValid());
        QCOMPARE(odd.green(), -0.25);
        QVERIFY(odd != FVColor(0.3, -0.25, 7, 0.5, u"kTQColorSpaceExtendedSRGB"_s));
        QVERIFY(!FVColor().isValid());
        QVERIFY(!FVColor(0, 0, 0, 1, u"sRGB"_s).isValid());
        QVERIFY(!FVColor(0, 0, 0, 1, u"kTQColorSpaceGray"_s).isValid());
        QVERIFY(!FVColor(std::numeric_limits<double>::quiet_NaN(), 0, 0).isValid());
        QVERIFY(!FVColor(0, 0, 0, std::numeric_limits<double>::infinity()).isValid());
        QVERIFY(!FVColor::fromQColor(QColor()).isValid());
        QVERIFY(!FVColor::fromQColor(Qt::red, QColorSpace()).isValid());
        QVERIFY(!FVColor().toQColor().isValid());
    }

    void colorsOfQtSpacesMeanTheSame_data()
    {
        addRows<QColorSpace, QString>({
            {"sRGB", QColorSpace(QColorSpace::SRgb), FVColor::sRGBName()},
            {"Display P3", QColorSpace(QColorSpace::DisplayP3), FVColor::displayP3Name()},
            {"linear sRGB", QColorSpace(QColorSpace::SRgbLinear), u"kTQColorSpaceLinearSRGB"_s},
            {"Adobe RGB", QColorSpace(QColorSpace::AdobeRgb), u"kTQColorSpaceLinearSRGB"_s},
            {"ProPhoto RGB", QColorSpace(QColorSpace::ProPhotoRgb), u"kTQColorSpaceLinearSRGB"_s},
            {"sRGB primaries, gamma 1.8", QColorSpace(QColorSpace::Primaries::SRgb, 1.8f),
             u"kTQColorSpaceLinearSRGB"_s},
            {"primaries of its own",
             QColorSpace(QPointF(0.3127, 0.329), QPointF(0.65, 0.33), QPointF(0.29, 0.61), QPointF(0.15, 0.06),
                         QColorSpace::TransferFunction::SRgb),
             FVColor::sRGBName()},
        });
    }
    void colorsOfQtSpacesMeanTheSame()
    {
        const auto [space, name] = row<QColorSpace, QString>();
        // Inside the gamut of sRGB, so that Qt's own conversion, which clips and is less precise, can be the judge.
        const QColor color = QColor::fromRgbF(0.5f, 0.45f, 0.4f, 0.25f);
        const FVColor converted = FVColor::fromQColor(color, space);
        QCOMPARE(converted.colorSpace(), name);
        const QColor expected = space.transformationToColorSpace(QColorSpace(QColorSpace::SRgb)).map(color);
        const QColor actual = converted.toQColor();
        QVERIFY2(std::abs(actual.redF() - expected.redF()) < 0.004f, qPrintable(actual.name() + expected.name()));
        QVERIFY2(std::abs(actual.greenF() - expected.greenF()) < 0.004f, qPrintable(actual.name() + expected.name()));
        QVERIFY2(std::abs(actual.blueF() - expected.blueF()) < 0.004f, qPrintable(actual.name() + expected.name()));
        QVERIFY(std::abs(actual.alphaF() - 0.25f) < 0.0001f);
    }

    void wideColorsAreClippedOnlyForQt()
    {
        const FVColor green(0, 1, 0, 1, FVColor::displayP3Name());
        QCOMPARE(green.toQColor(), QColor(0, 255, 0));
        QCOMPARE(green.red(), 0.0);
        QCOMPARE(green.colorSpace(), FVColor::displayP3Name());
        // Below zero survives in the extended space.
        const auto extended = QColor::fromRgbF(-0.25f, 0.5f, 1.25f);
        const auto kept = FVColor::fromQColor(extended);
        QVERIFY(kept.red() < -0.2 && kept.blue() > 1.2);
    }
};

QTEST_APPLESS_MAIN(FVColorTest)
#include "tst_fvcolor.moc"
