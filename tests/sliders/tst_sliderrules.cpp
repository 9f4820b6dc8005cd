#include "sliders/caretconfinement.h"
#include "sliders/editquestion.h"
#include "sliders/hexfieldrules.h"
#include "sliders/integerslidercontrolstyle.h"
#include "sliders/opacitybackground.h"
#include "sliders/percentageslidercontrolstyle.h"
#include "sliders/sliderkeys.h"
#include "sliders/sliderrules.h"

#include <QTest>

#include <limits>

using namespace favrin::sliders;
using favrin::model::SomeColor;
using favrin::platform::NumberFormatter;
using Component = SomeColor::Component;
using Space = SomeColor::ColorSpace;
using Style = NumberFormatter::Style;
using Value = std::optional<double>;

namespace {

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

/** The styles as people of a locale see them. */
struct Styles
{
    explicit Styles(const char *locale) : integers(Style::Integer, locale), percentages(Style::Percent, locale) {}

    NumberFormatter integers;
    NumberFormatter percentages;
    SliderControlStyle integer = IntegerSliderControlStyle(integers);
    SliderControlStyle percentage = PercentageSliderControlStyle(percentages, integers);
};

/** A text with the part to be replaced in brackets. */
struct Marked
{
    explicit Marked(const char *marked) : text(QString::fromUtf8(marked))
    {
        const auto start = text.indexOf(u'[');
        const auto end = text.indexOf(u']');
        text.remove(end, 1).remove(start, 1);
        range = {start, end - start - 1};
    }

    QString text;
    TextRange range;
};

bool accepts(const SliderControlStyle &style, const char *marked, const char *replacement)
{
    const Marked field(marked);
    return style.shouldChangeCharacters(field.text, field.range, QString::fromUtf8(replacement));
}

} // namespace

/** What places, keys and texts mean for a component of a color. */
class SliderRulesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void locationsMeanValues()
    {
        const auto value = [](double x, double width = 236.0) {
            const double fromLeft = valueAt(x, QSizeF(width, 36.0), Qt::LeftToRight);
            // On a mirrored track the same holds from the right edge.
            return valueAt(width - x, QSizeF(width, 36.0), Qt::RightToLeft) == fromLeft ? fromLeft : notANumber;
        };
        QCOMPARE(value(18.0), 0.0);
        QCOMPARE(value(68.0), 0.25);
        QCOMPARE(value(118.0), 0.5);
        QCOMPARE(value(218.0), 1.0);
        QCOMPARE(value(-500.0), 0.0);
        QCOMPARE(value(1e9), 1.0);
        // As wide as high, and narrower.
        QCOMPARE(value(36.0, 36.0), 0.0);
        QCOMPARE(value(20.0, 20.0), 0.0);
        QCOMPARE(value(notANumber), 0.0);
    }

    void thumbStandsWhereItsValueIs()
    {
        const QSizeF size(236.0, 36.0);
        QCOMPARE(thumbCenter(0.0, size, Qt::LeftToRight), QPointF(18.0, 18.0));
        QCOMPARE(thumbCenter(1.0, size, Qt::RightToLeft), QPointF(18.0, 18.0));
        for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
            for (double x = 18.0; x <= 218.0; x += 12.5)
                QCOMPARE(thumbCenter(valueAt(x, size, direction), size, direction).x(), x);
        }
    }

    void stopsAreTheEndsOfTheComponent()
    {
        using Stops = std::pair<SomeColor, SomeColor>;
        const auto p3 = [](double g, double a) { return SomeColor(0.1, g, 0.3, a, Space::displayP3); };
        QVERIFY(gradientStops(p3(0.2, 0.4), Component::g) == Stops(p3(0.0, 1.0), p3(1.0, 1.0)));
        QVERIFY(gradientStops(p3(0.2, 0.4), Component::a) == Stops(p3(0.2, 0.0), p3(0.2, 1.0)));
        QVERIFY(gradientStops(std::nullopt, Component::b) ==
                Stops(SomeColor(0.0, 0.0, 0.0, 1.0, Space::sRGB), SomeColor(0.0, 0.0, 1.0, 1.0, Space::sRGB)));
    }

    void keysMeanValues()
    {
        const auto means = [](Qt::Key key, double value, Value leftToRight, Value rightToLeft) {
            return valueForKey(key, {}, value, 255, Qt::LeftToRight) == leftToRight &&
                   valueForKey(key, {}, value, 255, Qt::RightToLeft) == rightToLeft &&
                   !valueForKey(key, Qt::ControlModifier, value, 255, Qt::LeftToRight);
        };
        const auto alwaysMeans = [means](Qt::Key key, double value, Value result) {
            return means(key, value, result, result);
        };
        QVERIFY(means(Qt::Key_Right, 100 / 255.0, 101 / 255.0, 99 / 255.0));
        QVERIFY(means(Qt::Key_Left, 100 / 255.0, 99 / 255.0, 101 / 255.0));
        QVERIFY(alwaysMeans(Qt::Key_Up, 100 / 255.0, 101 / 255.0));
        QVERIFY(alwaysMeans(Qt::Key_Down, 100 / 255.0, 99 / 255.0));
        // From between two steps, and at the ends.
        QVERIFY(alwaysMeans(Qt::Key_Up, 100.4 / 255.0, 101 / 255.0));
        QVERIFY(alwaysMeans(Qt::Key_Up, 1.0, 1.0));
        QVERIFY(alwaysMeans(Qt::Key_Down, 0.0, 0.0));
        QVERIFY(alwaysMeans(Qt::Key_PageUp, 0.25, 0.35));
        QVERIFY(alwaysMeans(Qt::Key_PageUp, 0.95, 1.0));
        QVERIFY(alwaysMeans(Qt::Key_PageDown, 0.5, 0.4));
        QVERIFY(alwaysMeans(Qt::Key_PageDown, 0.05, 0.0));
        QVERIFY(alwaysMeans(Qt::Key_Home, 0.5, 0.0));
        QVERIFY(alwaysMeans(Qt::Key_End, 0.5, 1.0));
        QVERIFY(alwaysMeans(Qt::Key_A, 0.5, std::nullopt));
        QVERIFY(alwaysMeans(Qt::Key_Tab, 0.5, std::nullopt));
    }

    void everyShownTextMeansItsValue_data()
    {
        QTest::addColumn<QString>("integer");
        QTest::addColumn<QString>("percentage");
        QTest::newRow("en") << "128" << QStringLiteral("50%");
        QTest::newRow("tr") << "128" << QStringLiteral("%50");
        QTest::newRow("ar-EG") << "١٢٨" << QStringLiteral("٥٠٪\u061c");
        QTest::newRow("fa") << "۱۲۸" << QStringLiteral("۵۰٪");
        QTest::newRow("mr") << "१२८" << QStringLiteral("५०%");
    }

    void everyShownTextMeansItsValue()
    {
        const Styles styles(QTest::currentDataTag());
        QTEST(styles.integer.floatToTextMapping(0.5), "integer");
        QTEST(styles.percentage.floatToTextMapping(0.5), "percentage");
        const auto isUnderstood = [](const SliderControlStyle &style, double value) {
            const QString text = style.floatToTextMapping(value);
            // Each text can be put in as a whole.
            return style.textToFloatMapping(text) == value && style.shouldChangeCharacters({}, {0, 0}, text);
        };
        for (int step = 0; step <= 255; ++step)
            QVERIFY(isUnderstood(styles.integer, step / 255.0));
        for (int step = 0; step <= 100; ++step)
            QVERIFY(isUnderstood(styles.percentage, step / 100.0));
    }

    void integersAreRounded()
    {
        const Styles english("en");
        const auto shown = [&english](double value) { return english.integer.floatToTextMapping(value); };
        // Halves away from zero.
        QCOMPARE(shown(0.5), QStringLiteral("128"));
        QCOMPARE(shown(126.5 / 255.0), QStringLiteral("127"));
        QCOMPARE(shown(127.4999 / 255.0), QStringLiteral("127"));
        for (const double value : {notANumber, std::numeric_limits<double>::infinity()}) {
            QCOMPARE(shown(value), QString());
            QCOMPARE(english.percentage.floatToTextMapping(value), QString());
        }
    }

    void textsAreRead()
    {
        for (const char *locale : {"en", "fa", "mr", "ar-EG", "tr"}) {
            const Styles styles(locale);
            const auto integer = [&](const char *text) {
                return styles.integer.textToFloatMapping(QString::fromUtf8(text));
            };
            QCOMPARE(integer("255"), Value(1.0));
            QCOMPARE(integer("300"), Value(1.0));
            QCOMPARE(integer("99999999999999999999999999"), Value(1.0));
            QCOMPARE(integer("१२८"), Value(128 / 255.0));
            QCOMPARE(integer("-1"), Value(0.0));
            QCOMPARE(integer(""), Value());
            QCOMPARE(integer("12%"), Value());
            const auto percentage = [&](const char *text) {
                return styles.percentage.textToFloatMapping(QString::fromUtf8(text));
            };
            QCOMPARE(percentage("%7"), Value(0.07));
            QCOMPARE(percentage("5\u00a00 %"), Value(0.5));
            QCOMPARE(percentage("٥٠٪\u061c"), Value(0.5));
            QCOMPARE(percentage("x1y2z"), Value(0.12));
            QCOMPARE(percentage("1.5%"), Value(0.15));
            QCOMPARE(percentage("150%"), Value(1.0));
            QCOMPARE(percentage("99999999999999999999999999%"), Value(1.0));
            QCOMPARE(percentage("%"), Value());
            QCOMPARE(percentage(""), Value());
        }
    }

    void integerEdits()
    {
        const SliderControlStyle style = Styles("en").integer;
        QVERIFY(accepts(style, "12[]", "8"));
        QVERIFY(accepts(style, "1[2]8", "9"));
        QVERIFY(accepts(style, "[128]", ""));
        QVERIFY(accepts(style, "[50%]", "12"));
        QVERIFY(!accepts(style, "128[]", "0"));
        QVERIFY(accepts(style, "[]", "999"));
        QVERIFY(!accepts(style, "[]", "1000"));
        QVERIFY(accepts(style, "[]", "٩٩٩"));
        // Three characters, six units.
        QVERIFY(accepts(style, "[]", "𝟏𝟐𝟑"));
        QVERIFY(!accepts(style, "[]", "𝟏𝟐𝟑𝟒"));
        for (const char *noDigit : {"½", "²", "Ⅷ", " ", "-", ".", "a"})
            QVERIFY2(!accepts(style, "1[]", noDigit), noDigit);
    }

    void percentageEdits()
    {
        const Styles english("en");
        QVERIFY(accepts(english.percentage, "[50]%", "7"));
        QVERIFY(accepts(english.percentage, "[50%]", ""));
        QVERIFY(accepts(english.percentage, "5[0]%", "\t"));
        for (const char *accepted : {"0000", "\u2009", "%"})
            QVERIFY2(accepts(english.percentage, "50[]%", accepted), accepted);
        for (const char *refused : {"\n", "٪", "a", ","})
            QVERIFY2(!accepts(english.percentage, "50[]%", refused), refused);
        const Styles egyptian("ar-EG");
        for (const char *accepted : {"٪", "7", "\u061c"})
            QVERIFY2(accepts(egyptian.percentage, "٥٠[]٪\u061c", accepted), accepted);
        QVERIFY(!accepts(egyptian.percentage, "٥٠[]٪\u061c", "%"));
        const Styles persian("fa");
        QVERIFY(!accepts(persian.percentage, "۵۰[]٪", "\u061c"));
        // Such a text has come about elsewhere; whatever is typed into it is accepted.
        QVERIFY(accepts(english.percentage, "50[] pct", "abc"));
        QVERIFY(accepts(persian.percentage, "50[]%", "x"));
    }

    void editsOutsideTheTextAreRefused()
    {
        const Styles styles("en");
        constexpr auto largest = std::numeric_limits<qsizetype>::max();
        const QString digit = QStringLiteral("1");
        for (const TextRange range : {TextRange{0, 4}, {2, 2}, {4, 0}, {-1, 1}, {1, -1}, {largest, 1}, {1, largest}}) {
            QVERIFY(!styles.integer.shouldChangeCharacters(QStringLiteral("128"), range, digit));
            QVERIFY(!styles.percentage.shouldChangeCharacters(QStringLiteral("50%"), range, digit));
            QVERIFY(!acceptsHexEdit(QStringLiteral("F0D"), range, digit));
        }
        QVERIFY(styles.integer.shouldChangeCharacters(QStringLiteral("12"), {2, 0}, digit));
    }

    void caretStaysAtTheNumber()
    {
        // Where a caret put at 0, 1, 2 … ends up.
        const auto places = [](const char *utf8) {
            const auto text = QString::fromUtf8(utf8);
            QList<qsizetype> list;
            for (qsizetype caret = 0; caret <= text.size(); ++caret)
                list << confinedCaret(text, caret);
            return list;
        };
        using Places = QList<qsizetype>;
        QCOMPARE(places("50%"), (Places{0, 1, 2, 2}));
        QCOMPARE(places("50\u00a0%"), (Places{0, 1, 2, 2, 2}));
        QCOMPARE(places("%50"), (Places{1, 1, 2, 3}));
        QCOMPARE(places("%\u00a050"), (Places{2, 2, 2, 3, 4}));
        QCOMPARE(places("٥٠٪\u061c"), (Places{0, 1, 2, 2, 2}));
        QCOMPARE(places("1 2 3"), (Places{0, 1, 1, 1, 1, 1}));
        QCOMPARE(places("%"), (Places{0, 1}));
        QCOMPARE(places(""), Places{0});
        QCOMPARE(places("𝟏𝟐%"), (Places{0, 1, 2, 3, 4, 4}));
    }

    void hexEdits()
    {
        const auto isAccepted = [](const char *marked, const char *replacement) {
            const Marked field(marked);
            return acceptsHexEdit(field.text, field.range, QString::fromUtf8(replacement));
        };
        QVERIFY(isAccepted("F0[]", "0"));
        QVERIFY(isAccepted("F0[]", "a"));
        QVERIFY(isAccepted("[F0]", ""));
        QVERIFY(isAccepted("[F00]", "ABCDEF"));
        QVERIFY(isAccepted("0061F[D]", "0"));
        QVERIFY(!isAccepted("0061FD[]", "0"));
        for (const char *noDigit : {"#", "g", " ", "٣", "Ａ"})
            QVERIFY2(!isAccepted("F0[]", noDigit), noDigit);
    }

    void pastedColorsBecomeDigits()
    {
        const auto result = [](const char *marked, const char *pasted) {
            const Marked field(marked);
            return edited(field.text,
                          withColorAsDigits(field.text, {field.range, QString::fromUtf8(pasted)}, Space::sRGB));
        };
        QCOMPARE(result("[FFFFFF]", "#0061fd"), QStringLiteral("0061FD"));
        QCOMPARE(result("[FFFFFF]", "abc"), QStringLiteral("AABBCC"));
        // Opacity is left out, and another space converted.
        QCOMPARE(result("[FFFFFF]", "\"#0061FD80\""), QStringLiteral("0061FD"));
        QCOMPARE(result("[]", " rgb(0 97 253) "), QStringLiteral("0061FD"));
        QCOMPARE(result("[]", "color(display-p3 0 1 0)"), QStringLiteral("00FF00"));
        // Where there is no room, in place of all; a part of a code stays one where it fits.
        QCOMPARE(result("FFFFFF[]", "#0061FD"), QStringLiteral("0061FD"));
        QCOMPARE(result("F[F]F", "tomato"), QStringLiteral("FF6347"));
        QCOMPARE(result("FF[]", "0061"), QStringLiteral("FF0061"));
        QCOMPARE(result("123[]", "abc"), QStringLiteral("123abc"));
        // What is no color is left to the filter, and so is a single character, which is typed.
        QCOMPARE(result("12[]", "hello"), QStringLiteral("12hello"));
        QCOMPARE(result("12[]", "r"), QStringLiteral("12r"));
    }

    void editIsFoundOut()
    {
        const auto isFound = [](const char *selected, const char *afterwards, const char *replaced,
                                const char *replacement) {
            const Marked before(selected);
            const auto after = QString::fromUtf8(afterwards);
            const TextEdit edit = editBetween(before.text, before.range, after);
            return edit.range == Marked(replaced).range && edit.replacement == QString::fromUtf8(replacement) &&
                   edited(before.text, edit) == after;
        };
        QVERIFY(isFound("1[]2", "192", "1[]2", "9"));
        // A repeated digit is the one at the caret.
        QVERIFY(isFound("11[]", "111", "11[]", "1"));
        QVERIFY(isFound("[128]", "1", "[128]", "1"));
        // What is pasted may resemble what was there.
        QVERIFY(isFound("[FF0000]", "#ff0000", "[FF0000]", "#ff0000"));
        QVERIFY(isFound("0061FD[]", "0061FD#0061FD", "0061FD[]", "#0061FD"));
        QVERIFY(isFound("12[]8", "18", "1[2]8", ""));
        QVERIFY(isFound("1[28]", "1", "1[28]", ""));
        QVERIFY(isFound("128[]", "028", "[1]28", "0"));
        QVERIFY(isFound("128[]", "128", "128[]", ""));
        const TextEdit stale = editBetween(QStringLiteral("1"), {5, 3}, QStringLiteral("12"));
        QVERIFY(stale.range == (TextRange{1, 0}) && stale.replacement == u"2");
    }

    void questionIsAskedOncePerEdit()
    {
        QStringList asked;
        EditQuestion question([&asked](const QString &text, const TextEdit &edit) -> std::optional<TextEdit> {
            asked << text + u'/' + edit.replacement;
            if (edit.replacement == u"no")
                return std::nullopt;
            return edit.replacement == u"two" ? TextEdit{{0, text.size()}, QStringLiteral("2")} : edit;
        });
        const auto validate = [&question](QString text, int caret = 0) {
            const bool valid = question.validate(text, caret) == QValidator::Acceptable;
            return valid ? QStringLiteral("%1|%2").arg(text).arg(caret) : QStringLiteral("refused");
        };
        question.setText(QStringLiteral("x1"));
        question.setSelection({2, 0});
        QCOMPARE(validate(QStringLiteral("x1"), 2), QStringLiteral("x1|2"));
        QCOMPARE(asked, QStringList());
        QCOMPARE(validate(QStringLiteral("x1no"), 4), QStringLiteral("refused"));
        QCOMPARE(validate(QStringLiteral("x1two"), 5), QStringLiteral("2|1"));
        // The text input asks about the text that it was handed.
        QCOMPARE(validate(QStringLiteral("2"), 1), QStringLiteral("2|1"));
        QCOMPARE(asked.join(u' '), QStringLiteral("x1/no x1/two"));
        // An undo brings back what was shown at first.
        QCOMPARE(validate(QStringLiteral("x1"), 2), QStringLiteral("x1|2"));
        QCOMPARE(asked.size(), 2);
    }
};

QTEST_APPLESS_MAIN(SliderRulesTest)
#include "tst_sliderrules.moc"
