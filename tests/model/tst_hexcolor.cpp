#include "model/hexcolor.h"

#include "../shared/table.h"

#include <QTest>

#include <limits>

using namespace favrin;
using model::HexColorError;
using model::SomeColor;
using Space = model::SomeColor::ColorSpace;
using namespace Qt::StringLiterals;

namespace {

constexpr HexColorError notHex = {"com.quenta.diagnostics.invalidHexValue", -1};

std::optional<SomeColor> parsed(const QString &text, Space space = Space::sRGB, HexColorError *error = nullptr)
{
    return model::hexValuedColor(text.toStdU16String(), model::platformName(space), error);
}

} // namespace

class HexColorTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void isFormatted_data()
    {
        addRows<double, double, double, QString>({
            {"each in its place", 0.0, 97 / 255.0, 253 / 255.0, u"0061FD"_s},
            {"half rounds up", 0.5, 0.5, 0.5, u"808080"_s},
            {"below and above the half", 0.998, 0.9981, 0.0, u"FEFF00"_s},
            // In double precision 0.4999999…, in single precision 0.5.
            {"single precision", 0.49999999999 / 255.0, 0.0, 1.0, u"0100FF"_s},
            {"no number is no crash", std::numeric_limits<double>::quiet_NaN(), std::numeric_limits<double>::infinity(),
             -1e300, u"000000"_s},
        });
    }
    void isFormatted()
    {
        const auto [red, green, blue, text] = row<double, double, double, QString>();
        for (const double alpha : {0.0, 0.2, 1.0}) {
            for (const Space space : model::allColorSpaces)
                QCOMPARE(QString::fromStdString(model::hexString({red, green, blue, alpha, space})), text);
        }
    }

    void isParsed_data()
    {
        addRows<int, int, int>({
            {"#0061FD", 0, 97, 253},
            {"0061fd", 0, 97, 253},
            {"#0061Fd", 0, 97, 253},
            {"#abc", 170, 187, 204},
            {"1g2!3z", 1, 2, 3},
            {" 1\t2\n3", 1, 2, 3},
            {"0xF0f0", 0, 0xF0, 0xF0},
            {"1é2345", 1, 0x23, 0x45},
        });
    }
    void isParsed()
    {
        const auto [red, green, blue] = row<int, int, int>();
        HexColorError error = {"untouched", 7};
        const auto color = parsed(QString::fromUtf8(QTest::currentDataTag()), Space::displayP3, &error);
        QVERIFY(color);
        QVERIFY(*color == SomeColor(red / 255.0, green / 255.0, blue / 255.0, 1.0, Space::displayP3));
        QCOMPARE(error.code, 7);
        // What the hex field does with a parsed color: nothing may change.
        QVERIFY(SomeColor(color->platformColor(), Space::displayP3) == *color);
    }

    void isRejected_data()
    {
        QTest::addColumn<QString>("text");
        for (const char *text : {"", "#", "##abc", "##", "12345", "1234", "1234567", "ABCDEF12", " abc", "abc ",
                                 "GG0000", "00GG00", "0000g0", "-1-1-1", "+1+1+1", "#12", "é12", "😀1", "١٢٣"})
            QTest::newRow(text) << QString::fromUtf8(text);
    }
    void isRejected()
    {
        QFETCH(QString, text);
        HexColorError error;
        QVERIFY(!parsed(text, Space::sRGB, &error));
        QVERIFY(error == notHex);
        QVERIFY(!parsed(text));
    }

    void unknownSpaceIsReadAsSRGB()
    {
        QVERIFY(model::hexValuedColor(u"ff0000", "kTQColorSpaceGray")->colorSpace == Space::sRGB);
        QVERIFY(model::hexValuedColor(u"ff0000", "")->colorSpace == Space::sRGB);
    }

    void everyCodeComesBack()
    {
        for (int value = 0; value < 256; ++value) {
            const auto digits = u"%1"_s.arg(value, 2, 16, QLatin1Char('0')).toUpper();
            const QString text = digits + u"00"_s + digits;
            QCOMPARE(QString::fromStdString(model::hexString(*parsed(text))), text);
        }
    }
};

QTEST_APPLESS_MAIN(HexColorTest)
#include "tst_hexcolor.moc"
