#include "model/csscolor.h"
#include "model/hexcolor.h"

#include <QColor>
#include <QTest>

using namespace favrin;
using model::SomeColor;
using Space = model::SomeColor::ColorSpace;
using namespace Qt::StringLiterals;

class CssColorTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void isUnderstood_data()
    {
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("digits");
        QTest::addColumn<double>("alpha");
        QTest::addColumn<bool>("isDisplayP3");
        const auto row = [](const char *text, const char *digits, double alpha = 1.0, bool isDisplayP3 = false) {
            QTest::newRow(text) << QString::fromUtf8(text) << QString::fromUtf8(digits) << alpha << isDisplayP3;
        };
        // Bare digits are read in the space of the one who asks, here Display P3.
        row("0061FD", "0061FD", 1.0, true);
        row("#0061fd", "0061FD", 1.0, true);
        row("abc", "AABBCC", 1.0, true);
        row("#ABC", "AABBCC", 1.0, true);
        row("#abc0", "AABBCC", 0.0, true);
        row("#0061FD33", "0061FD", 0.2, true);
        row("0061FDff", "0061FD", 1.0, true);
        row("  \"#0061FD\";\n", "0061FD", 1.0, true);
        row("'#fff'", "FFFFFF", 1.0, true);
        row("rgb(0, 97, 253)", "0061FD");
        row("RGB(0 97 253)", "0061FD");
        row("rgb( 0 , 97,253 )", "0061FD");
        row("rgba(0, 97, 253, 0.2)", "0061FD", 0.2);
        row("rgb(0 97 253 / 20%)", "0061FD", 0.2);
        row("rgb(0 97 253/.2)", "0061FD", 0.2);
        row("rgb(100%, 0%, 50%)", "FF0080");
        row("rgb(999, -5, 1e2)", "FF0064");
        row("hsl(120, 100%, 25%)", "008000");
        row("hsla(0 0% 50% / 20%)", "808080", 0.2);
        row("hsl(-150deg 100 50)", "0080FF");
        row("hsl(0.5turn 100% 50%)", "00FFFF");
        row("hsl(400grad, 50%, 75%)", "DF9F9F");
        row("hsl(3.14159265358979rad 100% 50%)", "00FFFF");
        row("hwb(210 0% 0%)", "0080FF");
        row("hwb(90 20% 40% / .5)", "669933", 0.5);
        row("hwb(90 60% 90%)", "666666");
        row("color(display-p3 1 0.5 0)", "FF8000", 1.0, true);
        row("color(display-p3 100% 50% 0% / 0.2)", "FF8000", 0.2, true);
        row("color(srgb 1 0.5 0)", "FF8000");
        row("RebeccaPurple", "663399");
        row(" tan ", "D2B48C");
    }
    void isUnderstood()
    {
        QFETCH(QString, text);
        QFETCH(double, alpha);
        QFETCH(bool, isDisplayP3);
        const auto color = model::colorFromCssText(text.toStdString(), Space::displayP3);
        QVERIFY(color);
        QTEST(QString::fromStdString(model::hexString(*color)), "digits");
        QCOMPARE(color->a, alpha);
        QCOMPARE(color->colorSpace == Space::displayP3, isDisplayP3);
    }

    void isNoColor_data()
    {
        QTest::addColumn<QString>("text");
        const auto rows = u"| |\"\"|#|##fff|12|12345|1234567|123456789|gggggg|-12345|0x1234|# ffffff|reddish|"
                          "transparent|rgb|rgb(|rgb()|rgb(1)|rgb(1,2)|rgb(1,2,3,4,5)|rgb(1,,2,3)|rgb(1,2,3,)|"
                          "rgb(a,b,c)|rgb(1 2 3|rgb(1deg 2 3)|rgb(nan, 0, 0)|rgb(inf, 0, 0)|rgb(+-1,0,0)|"
                          "hsl(1,2)|hsl(1turns 2 3)|hsl(deg 2 3)|hsl(1% 2 3)|hwb(nan 0 0)|hsl(1e400 2 3)|"
                          "rgb(%,0,0)|rgb(0x10,0,0)|color(1 0 0)|color(display-p3)|color(display-p3 1 0)|"
                          "color(rec2020 1 0 0)|red blue|ﬀﬀﬀ|١٢٣٤٥٦"_s.split(u'|');
        for (const QString &text : rows)
            QTest::newRow(qUtf8Printable(text)) << text;
        QTest::newRow("very long") << QString(100'000, QLatin1Char('f'));
        QTest::newRow("long behind the blanks") << u"rgb(1,2,3"_s + QString(1000, QLatin1Char(' ')) + QLatin1Char(')');
    }
    void isNoColor()
    {
        QFETCH(QString, text);
        QVERIFY(!model::colorFromCssText(text.toStdString(), Space::sRGB));
    }

    void namesAreThoseOfCss()
    {
        int known = 0;
        for (const QString &name : QColor::colorNames()) {
            if (name == u"transparent"_s)
                continue;
            const auto color = model::colorFromCssText(name.toStdString(), Space::displayP3);
            QVERIFY2(color, qPrintable(name));
            QCOMPARE(QLatin1Char('#') + QString::fromStdString(model::hexString(*color)).toLower(),
                     QColor(name).name());
            QCOMPARE(color->colorSpace, Space::sRGB);
            ++known;
        }
        QCOMPARE(known, 147);
    }

    void fractionsAreKept()
    {
        const auto color = model::colorFromCssText("rgb(127.5 0.3% 0 / .123)", Space::sRGB);
        QCOMPARE(color, std::optional(SomeColor(0.5, 0.3 / 100.0, 0.0, 0.123, Space::sRGB)));
    }
};

QTEST_APPLESS_MAIN(CssColorTest)
#include "tst_csscolor.moc"
