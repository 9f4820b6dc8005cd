#include "platform/text/numberformatter.h"

#include "../../shared/table.h"

#include <QTest>

#include <limits>

using favrin::platform::NumberFormatter;
using Style = NumberFormatter::Style;
using namespace Qt::StringLiterals;

namespace {

QString text(const NumberFormatter &formatter, double number)
{
    const auto string = formatter.string(number);
    return string ? QString::fromStdU16String(*string) : u"nothing"_s;
}

} // namespace

class NumberFormatterTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void writesAndReadsBack_data()
    {
        addRows<QString, QString, QString>({
            {"en-US", u"1234"_s, u"50%"_s, u"%"_s},
            {"en_US", u"1234"_s, u"50%"_s, u"%"_s},
            {"de", u"1234"_s, u"50\u00a0%"_s, u"%"_s},
            {"fr", u"1234"_s, u"50\u00a0%"_s, u"%"_s},
            {"tr", u"1234"_s, u"%50"_s, u"%"_s},
            {"eu", u"1234"_s, u"%\u00a050"_s, u"%"_s},
            {"ja", u"1234"_s, u"50%"_s, u"%"_s},
            {"ar-EG", u"١٢٣٤"_s, u"٥٠٪\u061c"_s, u"٪\u061c"_s},
            {"fa", u"۱۲۳۴"_s, u"۵۰٪"_s, u"٪"_s},
            {"mr", u"१२३४"_s, u"५०%"_s, u"%"_s},
            {"bn", u"১২৩৪"_s, u"৫০%"_s, u"%"_s},
            {"my", u"၁၂၃၄"_s, u"၅၀%"_s, u"%"_s},
            {"hi-u-nu-deva", u"१२३४"_s, u"५०%"_s, u"%"_s},
            {"no such place", u"1234"_s, u"50%"_s, u"%"_s},
        });
    }
    void writesAndReadsBack()
    {
        const auto [number, half, symbol] = row<QString, QString, QString>();
        const NumberFormatter integer(Style::Integer, QTest::currentDataTag());
        const NumberFormatter percent(Style::Percent, QTest::currentDataTag());
        QCOMPARE(text(integer, 1234), number);
        QCOMPARE(integer.number(*integer.string(1234)), std::optional(1234.0));
        QCOMPARE(text(percent, 0.5), half);
        QCOMPARE(QString::fromStdU16String(percent.percentSymbol()), symbol);
    }

    void roundsDecimalTiesToEven_data()
    {
        addRows<double, QString>({
            {"down", 0.125, u"12%"_s},
            {"up", 0.135, u"14%"_s},
            // As binary fractions these lie below their tie; as written they are one.
            {"written as a tie, up", 0.575, u"58%"_s},
            {"written as a tie, down", 0.145, u"14%"_s},
            {"just above", 0.1250001, u"13%"_s},
            {"smallest", 0.005, u"0%"_s},
            {"largest", 0.995, u"100%"_s},
            {"no sign on zero", -0.0, u"0%"_s},
        });
    }
    void roundsDecimalTiesToEven()
    {
        const auto [number, percent] = row<double, QString>();
        QCOMPARE(text(NumberFormatter(Style::Percent, "en"), number), percent);
    }

    void reads_data()
    {
        using Number = std::optional<double>;
        addRows<Number>({
            {"0", 0.0},
            {"007", 7.0},
            {"٢٥٥", 255.0},
            {"२५५", 255.0},
            {"2٥५", 255.0},
            {"𝟏𝟐", 12.0},
            {"-3", -3.0},
            {"99999999999999999999", 1e20},
            {"", std::nullopt},
            {" ", std::nullopt},
            {"12a", std::nullopt},
            {"1.5", std::nullopt},
            {"1 2", std::nullopt},
            {"ff", std::nullopt},
        });
    }
    void reads()
    {
        const auto [number] = row<std::optional<double>>();
        const auto written = QString::fromUtf8(QTest::currentDataTag()).toStdU16String();
        for (const char *locale : {"en", "de", "ar-EG", "mr"})
            QCOMPARE(NumberFormatter(Style::Integer, locale).number(written), number);
    }

    void isAsRobustAsItsInput()
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
};

QTEST_APPLESS_MAIN(NumberFormatterTest)
#include "tst_numberformatter.moc"
