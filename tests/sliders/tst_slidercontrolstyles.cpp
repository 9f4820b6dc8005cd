#include "sliders/integerslidercontrolstyle.h"
#include "sliders/percentageslidercontrolstyle.h"

#include <QTest>

#include <limits>

using namespace favrin::sliders;
using favrin::platform::NumberFormatter;
using Style = NumberFormatter::Style;
using Value = std::optional<double>;

Q_DECLARE_METATYPE(Value)

namespace {

/** The styles as people of a locale see them. */
struct Styles
{
    explicit Styles(const QString &locale)
        : integers(Style::Integer, locale.toStdString()), percentages(Style::Percent, locale.toStdString())
    {
    }

    NumberFormatter integers;
    NumberFormatter percentages;
    SliderControlStyle integer = IntegerSliderControlStyle(integers);
    SliderControlStyle percentage = PercentageSliderControlStyle(percentages, integers);
};

/** A text with the part to be replaced in brackets. */
bool accepts(const SliderControlStyle &style, const QString &marked, const QString &replacement)
{
    QString text = marked;
    const auto start = text.indexOf(u'[');
    const auto end = text.indexOf(u']');
    text.remove(end, 1).remove(start, 1);
    return style.shouldChangeCharacters(text, {start, end - start - 1}, replacement);
}

} // namespace

class SliderControlStylesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void everyShownTextMeansItsValue_data();
    void everyShownTextMeansItsValue();
    void integersAreShown_data();
    void integersAreShown();
    void integersAreRead_data();
    void integersAreRead();
    void percentagesAreRead_data();
    void percentagesAreRead();
    void integerEdits_data();
    void integerEdits();
    void percentageEdits_data();
    void percentageEdits();
    void editsOutsideTheTextAreRefused();
    void whatCannotBeShownIsEmpty();
};

void SliderControlStylesTest::everyShownTextMeansItsValue_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("integer");
    QTest::addColumn<QString>("percentage");
    const auto row = [](const char *locale, const char *integer, const char *percentage) {
        QTest::newRow(locale) << QString::fromUtf8(locale) << QString::fromUtf8(integer)
                              << QString::fromUtf8(percentage);
    };
    row("en", "128", "50%");
    row("tr", "128", "%50");
    row("ar-EG", "١٢٨", "٥٠٪\u061c");
    row("fa", "۱۲۸", "۵۰٪");
    row("mr", "१२८", "५०%");
}

void SliderControlStylesTest::everyShownTextMeansItsValue()
{
    QFETCH(QString, locale);
    const Styles styles(locale);
    QTEST(styles.integer.floatToTextMapping(0.5), "integer");
    QTEST(styles.percentage.floatToTextMapping(0.5), "percentage");
    for (int step = 0; step <= 255; ++step) {
        const QString text = styles.integer.floatToTextMapping(step / 255.0);
        QCOMPARE(styles.integer.textToFloatMapping(text), Value(step / 255.0));
        // Each text can be put in as a whole.
        QVERIFY(styles.integer.shouldChangeCharacters(QString(), {0, 0}, text));
    }
    for (int step = 0; step <= 100; ++step) {
        const QString text = styles.percentage.floatToTextMapping(step / 100.0);
        QCOMPARE(styles.percentage.textToFloatMapping(text), Value(step / 100.0));
        QVERIFY(styles.percentage.shouldChangeCharacters(QString(), {0, 0}, text));
    }
}

void SliderControlStylesTest::integersAreShown_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<QString>("text");
    QTest::newRow("half, away from zero") << 0.5 << QStringLiteral("128");
    QTest::newRow("half of an even one") << 126.5 / 255.0 << QStringLiteral("127");
    QTest::newRow("just below a half") << 127.4999 / 255.0 << QStringLiteral("127");
    QTest::newRow("nothing") << 0.0 << QStringLiteral("0");
    QTest::newRow("everything") << 1.0 << QStringLiteral("255");
}

void SliderControlStylesTest::integersAreShown()
{
    QFETCH(double, value);
    QTEST(Styles(QStringLiteral("en")).integer.floatToTextMapping(value), "text");
}

void SliderControlStylesTest::integersAreRead_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<Value>("value");
    const auto row = [](const char *text, Value value) { QTest::newRow(text) << QString::fromUtf8(text) << value; };
    row("255", 1.0);
    row("300", 1.0);
    row("99999999999999999999999999", 1.0);
    row("१२८", 128 / 255.0);
    row("", std::nullopt);
    row("12%", std::nullopt);
    row("-1", 0.0);
}

void SliderControlStylesTest::integersAreRead()
{
    QFETCH(QString, text);
    for (const char *locale : {"en", "fa", "mr"})
        QTEST(Styles(QString::fromUtf8(locale)).integer.textToFloatMapping(text), "value");
}

void SliderControlStylesTest::percentagesAreRead_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<Value>("value");
    const auto row = [](const char *text, Value value) { QTest::newRow(text) << QString::fromUtf8(text) << value; };
    row("50%", 0.5);
    row("%7", 0.07);
    row("5\u00a00 %", 0.5);
    row("٥٠٪\u061c", 0.5);
    row("x1y2z", 0.12);
    row("150%", 1.0);
    row("99999999999999999999999999%", 1.0);
    row("1.5%", 0.15);
    row("%", std::nullopt);
    row("", std::nullopt);
}

void SliderControlStylesTest::percentagesAreRead()
{
    QFETCH(QString, text);
    for (const char *locale : {"en", "ar-EG", "tr"})
        QTEST(Styles(QString::fromUtf8(locale)).percentage.textToFloatMapping(text), "value");
}

void SliderControlStylesTest::integerEdits_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("replacement");
    QTest::addColumn<bool>("accepted");
    const auto row = [](const char *text, const char *replacement, bool accepted) {
        QTest::addRow("%s by %s", text, replacement)
            << QString::fromUtf8(text) << QString::fromUtf8(replacement) << accepted;
    };
    row("12[]", "8", true);
    row("128[]", "0", false);
    row("1[2]8", "9", true);
    row("[128]", "", true);
    row("[]", "999", true);
    row("[]", "1000", false);
    row("[]", "٩٩٩", true);
    // Three characters, six units.
    row("[]", "𝟏𝟐𝟑", true);
    row("[]", "𝟏𝟐𝟑𝟒", false);
    row("1[]", "½", false);
    row("1[]", "²", false);
    row("1[]", "Ⅷ", false);
    row("1[]", " ", false);
    row("1[]", "-", false);
    row("1[]", ".", false);
    row("1[]", "a", false);
    row("[50%]", "12", true);
}

void SliderControlStylesTest::integerEdits()
{
    QFETCH(QString, text);
    QFETCH(QString, replacement);
    QTEST(accepts(Styles(QStringLiteral("en")).integer, text, replacement), "accepted");
}

void SliderControlStylesTest::percentageEdits_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("replacement");
    QTest::addColumn<bool>("accepted");
    const auto row = [](const char *locale, const char *text, const char *replacement, bool accepted) {
        QTest::addRow("%s: %s by %s", locale, text, replacement)
            << QString::fromUtf8(locale) << QString::fromUtf8(text) << QString::fromUtf8(replacement) << accepted;
    };
    row("en", "[50]%", "7", true);
    row("en", "50[]%", "0000", true);
    row("en", "5[0]%", "\t", true);
    row("en", "50[]%", "\u2009", true);
    row("en", "50[]%", "\n", false);
    row("en", "50[]%", "%", true);
    row("en", "50[]%", "٪", false);
    row("en", "50[]%", "a", false);
    row("en", "50[]%", ",", false);
    row("en", "[50%]", "", true);
    row("ar-EG", "٥٠[]٪\u061c", "٪", true);
    row("ar-EG", "٥٠[]٪\u061c", "7", true);
    row("ar-EG", "٥٠[]٪\u061c", "\u061c", true);
    row("ar-EG", "٥٠[]٪\u061c", "%", false);
    row("fa", "۵۰[]٪", "\u061c", false);
    // Such a text has come about elsewhere; whatever is typed into it is accepted.
    row("en", "50[] pct", "abc", true);
    row("fa", "50[]%", "x", true);
}

void SliderControlStylesTest::percentageEdits()
{
    QFETCH(QString, locale);
    QFETCH(QString, text);
    QFETCH(QString, replacement);
    QTEST(accepts(Styles(locale).percentage, text, replacement), "accepted");
}

void SliderControlStylesTest::editsOutsideTheTextAreRefused()
{
    const Styles styles(QStringLiteral("en"));
    constexpr auto largest = std::numeric_limits<qsizetype>::max();
    for (const TextRange range : {TextRange{0, 4}, {2, 2}, {4, 0}, {-1, 1}, {1, -1}, {largest, 1}, {1, largest}}) {
        QVERIFY(!styles.integer.shouldChangeCharacters(QStringLiteral("128"), range, QStringLiteral("1")));
        QVERIFY(!styles.percentage.shouldChangeCharacters(QStringLiteral("50%"), range, QStringLiteral("1")));
    }
    QVERIFY(styles.integer.shouldChangeCharacters(QStringLiteral("12"), {2, 0}, QStringLiteral("1")));
}

void SliderControlStylesTest::whatCannotBeShownIsEmpty()
{
    const Styles styles(QStringLiteral("en"));
    for (const double value : {std::numeric_limits<double>::quiet_NaN(), std::numeric_limits<double>::infinity()}) {
        QCOMPARE(styles.integer.floatToTextMapping(value), QString());
        QCOMPARE(styles.percentage.floatToTextMapping(value), QString());
    }
}

QTEST_APPLESS_MAIN(SliderControlStylesTest)
#include "tst_slidercontrolstyles.moc"
