#include "platform/text/numberformatter.h"

#include <QTest>

#include <limits>

using favrin::platform::NumberFormatter;
using Style = NumberFormatter::Style;

namespace {

QString text(const NumberFormatter &formatter, double number)
{
    const auto string = formatter.string(number);
    return string ? QString::fromStdU16String(*string) : QStringLiteral("nothing");
}

} // namespace

class NumberFormatterTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void writesAndReadsBack_data();
    void writesAndReadsBack();
    void roundsDecimalTiesToEven_data();
    void roundsDecimalTiesToEven();
    void reads_data();
    void reads();
    void isAsRobustAsItsInput();
};

void NumberFormatterTest::writesAndReadsBack_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("integer");
    QTest::addColumn<QString>("percent");
    QTest::addColumn<QString>("symbol");
    const auto row = [](const char *locale, const char *integer, const char *percent, const char *symbol = "%") {
        QTest::newRow(locale) << QString::fromUtf8(locale) << QString::fromUtf8(integer) << QString::fromUtf8(percent)
                              << QString::fromUtf8(symbol);
    };
    row("en-US", "1234", "50%");
    row("en_US", "1234", "50%");
    row("de", "1234", "50\u00a0%");
    row("fr", "1234", "50\u00a0%");
    row("tr", "1234", "%50");
    row("eu", "1234", "%\u00a050");
    row("ja", "1234", "50%");
    row("ar-EG", "١٢٣٤", "٥٠٪\u061c", "٪\u061c");
    row("fa", "۱۲۳۴", "۵۰٪", "٪");
    row("mr", "१२३४", "५०%");
    row("bn", "১২৩৪", "৫০%");
    row("my", "၁၂၃၄", "၅၀%");
    row("hi-u-nu-deva", "१२३४", "५०%");
    row("no such place", "1234", "50%");
}

void NumberFormatterTest::writesAndReadsBack()
{
    QFETCH(QString, locale);
    const NumberFormatter integer(Style::Integer, locale.toStdString());
    const NumberFormatter percent(Style::Percent, locale.toStdString());
    QTEST(text(integer, 1234), "integer");
    QCOMPARE(integer.number(*integer.string(1234)), std::optional(1234.0));
    QTEST(text(percent, 0.5), "percent");
    QTEST(QString::fromStdU16String(percent.percentSymbol()), "symbol");
}

void NumberFormatterTest::roundsDecimalTiesToEven_data()
{
    QTest::addColumn<double>("number");
    QTest::addColumn<QString>("percent");
    QTest::newRow("down") << 0.125 << QStringLiteral("12%");
    QTest::newRow("up") << 0.135 << QStringLiteral("14%");
    // As binary fractions these lie below their tie; as written they are one.
    QTest::newRow("written as a tie, up") << 0.575 << QStringLiteral("58%");
    QTest::newRow("written as a tie, down") << 0.145 << QStringLiteral("14%");
    QTest::newRow("just above") << 0.1250001 << QStringLiteral("13%");
    QTest::newRow("smallest") << 0.005 << QStringLiteral("0%");
    QTest::newRow("largest") << 0.995 << QStringLiteral("100%");
    QTest::newRow("no sign on zero") << -0.0 << QStringLiteral("0%");
}

void NumberFormatterTest::roundsDecimalTiesToEven()
{
    QFETCH(double, number);
    QTEST(text(NumberFormatter(Style::Percent, "en"), number), "percent");
}

void NumberFormatterTest::reads_data()
{
    using Number = std::optional<double>;
    QTest::addColumn<QString>("written");
    QTest::addColumn<Number>("number");
    const auto row = [](const char *written, Number number) {
        QTest::newRow(written) << QString::fromUtf8(written) << number;
    };
    row("0", 0.0);
    row("007", 7.0);
    row("٢٥٥", 255.0);
    row("२५५", 255.0);
    row("2٥५", 255.0);
    row("𝟏𝟐", 12.0);
    row("-3", -3.0);
    row("99999999999999999999", 1e20);
    row("", std::nullopt);
    row(" ", std::nullopt);
    row("12a", std::nullopt);
    row("1.5", std::nullopt);
    row("1 2", std::nullopt);
    row("ff", std::nullopt);
}

void NumberFormatterTest::reads()
{
    QFETCH(QString, written);
    for (const char *locale : {"en", "de", "ar-EG", "mr"})
        QTEST(NumberFormatter(Style::Integer, locale).number(written.toStdU16String()), "number");
}

void NumberFormatterTest::isAsRobustAsItsInput()
{
    const NumberFormatter integer(Style::Integer, "en");
    const auto many = integer.number(std::u16string(5000, u'9'));
    QVERIFY(many && *many > 1e300);
    for (const double number : {std::numeric_limits<double>::quiet_NaN(), std::numeric_limits<double>::infinity()})
        QVERIFY(!integer.string(number));
    const char16_t half[] = {0xd800, 0};
    QVERIFY(!integer.number(half));
    for (const std::string &locale : {std::string(), std::string("C"), std::string("-"), std::string(9999, 'x'),
                                      std::string("en-\xff"), std::string("ar@numbers=nonsense")})
        QVERIFY2(NumberFormatter(Style::Integer, locale).string(255), locale.c_str());
}

QTEST_APPLESS_MAIN(NumberFormatterTest)
#include "tst_numberformatter.moc"
