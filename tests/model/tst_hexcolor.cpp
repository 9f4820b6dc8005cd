#include "model/hexcolor.h"

#include <QTest>

#include <limits>

using namespace favrin;
using model::HexColorError;
using model::SomeColor;
using Space = model::SomeColor::ColorSpace;

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
    void isFormatted_data();
    void isFormatted();
    void isParsed_data();
    void isParsed();
    void isRejected_data();
    void isRejected();
    void unknownSpaceIsReadAsSRGB();
    void everyCodeComesBack();
};

void HexColorTest::isFormatted_data()
{
    QTest::addColumn<double>("red");
    QTest::addColumn<double>("green");
    QTest::addColumn<double>("blue");
    QTest::addColumn<QString>("text");
    QTest::newRow("each in its place") << 0.0 << 97 / 255.0 << 253 / 255.0 << QStringLiteral("0061FD");
    QTest::newRow("half rounds up") << 0.5 << 0.5 << 0.5 << QStringLiteral("808080");
    QTest::newRow("below and above the half") << 0.998 << 0.9981 << 0.0 << QStringLiteral("FEFF00");
    // In double precision 0.4999999…, in single precision 0.5.
    QTest::newRow("single precision") << 0.49999999999 / 255.0 << 0.0 << 1.0 << QStringLiteral("0100FF");
    QTest::newRow("no number is no crash")
        << std::numeric_limits<double>::quiet_NaN() << std::numeric_limits<double>::infinity() << -1e300
        << QStringLiteral("000000");
}

void HexColorTest::isFormatted()
{
    QFETCH(double, red);
    QFETCH(double, green);
    QFETCH(double, blue);
    for (const double alpha : {0.0, 0.2, 1.0}) {
        for (const Space space : model::allColorSpaces)
            QTEST(QString::fromStdString(model::hexString({red, green, blue, alpha, space})), "text");
    }
}

void HexColorTest::isParsed_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<int>("red");
    QTest::addColumn<int>("green");
    QTest::addColumn<int>("blue");
    const auto row = [](const QString &text, int red, int green, int blue) {
        QTest::newRow(qPrintable(text)) << text << red << green << blue;
    };
    row(QStringLiteral("#0061FD"), 0, 97, 253);
    row(QStringLiteral("0061fd"), 0, 97, 253);
    row(QStringLiteral("#0061Fd"), 0, 97, 253);
    row(QStringLiteral("#abc"), 170, 187, 204);
    row(QStringLiteral("1g2!3z"), 1, 2, 3);
    row(QStringLiteral(" 1\t2\n3"), 1, 2, 3);
    row(QStringLiteral("0xF0f0"), 0, 0xF0, 0xF0);
    row(QStringLiteral("1é2345"), 1, 0x23, 0x45);
}

void HexColorTest::isParsed()
{
    QFETCH(QString, text);
    QFETCH(int, red);
    QFETCH(int, green);
    QFETCH(int, blue);
    HexColorError error = {"untouched", 7};
    const auto color = parsed(text, Space::displayP3, &error);
    QVERIFY(color);
    QVERIFY(*color == SomeColor(red / 255.0, green / 255.0, blue / 255.0, 1.0, Space::displayP3));
    QCOMPARE(error.code, 7);
    // What the hex field does with a parsed color: nothing may change.
    QVERIFY(SomeColor(color->platformColor(), Space::displayP3) == *color);
}

void HexColorTest::isRejected_data()
{
    QTest::addColumn<QString>("text");
    for (const char *text : {"", "#", "##abc", "##", "12345", "1234", "1234567", "ABCDEF12", " abc", "abc ", "GG0000",
                             "00GG00", "0000g0", "-1-1-1", "+1+1+1", "#12", "é12", "😀1", "١٢٣"})
        QTest::newRow(text) << QString::fromUtf8(text);
}

void HexColorTest::isRejected()
{
    QFETCH(QString, text);
    HexColorError error;
    QVERIFY(!parsed(text, Space::sRGB, &error));
    QVERIFY(error == notHex);
    QVERIFY(!parsed(text));
}

void HexColorTest::unknownSpaceIsReadAsSRGB()
{
    QVERIFY(model::hexValuedColor(u"ff0000", "kTQColorSpaceGray")->colorSpace == Space::sRGB);
    QVERIFY(model::hexValuedColor(u"ff0000", "")->colorSpace == Space::sRGB);
}

void HexColorTest::everyCodeComesBack()
{
    for (int value = 0; value < 256; ++value) {
        const auto digits = QStringLiteral("%1").arg(value, 2, 16, QLatin1Char('0')).toUpper();
        const QString text = digits + QStringLiteral("00") + digits;
        QCOMPARE(QString::fromStdString(model::hexString(*parsed(text))), text);
    }
}

QTEST_APPLESS_MAIN(HexColorTest)
#include "tst_hexcolor.moc"
