#include "sliders/caretconfinement.h"
#include "sliders/editquestion.h"
#include "sliders/hexfieldrules.h"

#include <QTest>

using namespace favrin::sliders;
using favrin::model::SomeColor;

Q_DECLARE_METATYPE(favrin::sliders::TextRange)

class TextFieldRulesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void caretStaysAtTheNumber_data();
    void caretStaysAtTheNumber();
    void hexEdits_data();
    void hexEdits();
    void pastedColorsBecomeDigits_data();
    void pastedColorsBecomeDigits();
    void editIsFoundOut_data();
    void editIsFoundOut();
    void questionIsAskedOncePerEdit();
};

void TextFieldRulesTest::caretStaysAtTheNumber_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QList<int>>("places");
    // Where a caret put at 0, 1, 2 … ends up.
    const auto row = [](const char *text, const QList<int> &places) {
        QTest::newRow(text) << QString::fromUtf8(text) << places;
    };
    row("50%", {0, 1, 2, 2});
    row("50\u00a0%", {0, 1, 2, 2, 2});
    row("%50", {1, 1, 2, 3});
    row("%\u00a050", {2, 2, 2, 3, 4});
    row("٥٠٪\u061c", {0, 1, 2, 2, 2});
    row("५०%", {0, 1, 2, 2});
    row("1 2 3", {0, 1, 1, 1, 1, 1});
    row("%", {0, 1});
    row("", {0});
    row("𝟏𝟐%", {0, 1, 2, 3, 4, 4});
}

void TextFieldRulesTest::caretStaysAtTheNumber()
{
    QFETCH(QString, text);
    QFETCH(QList<int>, places);
    QList<int> actual;
    for (int caret = 0; caret <= text.size(); ++caret)
        actual << static_cast<int>(confinedCaret(text, caret));
    QCOMPARE(actual, places);
}

void TextFieldRulesTest::hexEdits_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<TextRange>("range");
    QTest::addColumn<QString>("replacement");
    QTest::addColumn<bool>("accepted");
    const auto row = [](const char *text, TextRange range, const char *replacement, bool accepted) {
        QTest::addRow("%s by %s", text, replacement)
            << QString::fromUtf8(text) << range << QString::fromUtf8(replacement) << accepted;
    };
    row("F0", {2, 0}, "0", true);
    row("F0", {2, 0}, "a", true);
    row("F0", {0, 2}, "", true);
    row("F00", {0, 3}, "ABCDEF", true);
    row("0061FD", {6, 0}, "0", false);
    row("0061FD", {5, 1}, "0", true);
    row("F0", {0, 0}, "#", false);
    row("F0", {2, 0}, "g", false);
    row("F0", {2, 0}, " ", false);
    row("F0", {2, 0}, "٣", false);
    row("F0", {2, 0}, "Ａ", false);
    row("F0", {0, 3}, "1", false);
    row("F0", {3, 0}, "1", false);
}

void TextFieldRulesTest::hexEdits()
{
    QFETCH(QString, text);
    QFETCH(TextRange, range);
    QFETCH(QString, replacement);
    QTEST(acceptsHexEdit(text, range, replacement), "accepted");
}

void TextFieldRulesTest::pastedColorsBecomeDigits_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<TextRange>("range");
    QTest::addColumn<QString>("pasted");
    QTest::addColumn<QString>("result");
    const auto row = [](const char *name, const char *text, TextRange range, const char *pasted, const char *result) {
        QTest::newRow(name) << QString::fromUtf8(text) << range << QString::fromUtf8(pasted)
                            << QString::fromUtf8(result);
    };
    row("over everything", "FFFFFF", {0, 6}, "#0061fd", "0061FD");
    row("three digits", "FFFFFF", {0, 6}, "abc", "AABBCC");
    row("opacity is left out", "FFFFFF", {0, 6}, "\"#0061FD80\"", "0061FD");
    row("into nothing", "", {0, 0}, " rgb(0 97 253) ", "0061FD");
    row("no room: in place of all", "FFFFFF", {6, 0}, "#0061FD", "0061FD");
    row("beside a part", "FFF", {1, 1}, "tomato", "FF6347");
    row("a part of a code stays one", "FF", {2, 0}, "0061", "FF0061");
    row("three digits where they fit", "123", {3, 0}, "abc", "123abc");
    row("another space is converted", "", {0, 0}, "color(display-p3 0 1 0)", "00FF00");
    row("no color is left to the filter", "12", {2, 0}, "hello", "12hello");
    row("a single character is typed", "12", {2, 0}, "r", "12r");
}

void TextFieldRulesTest::pastedColorsBecomeDigits()
{
    QFETCH(QString, text);
    QFETCH(TextRange, range);
    QFETCH(QString, pasted);
    const auto edit = withColorAsDigits(text, {range, pasted}, SomeColor::ColorSpace::sRGB);
    QTEST(edited(text, edit), "result");
}

void TextFieldRulesTest::editIsFoundOut_data()
{
    QTest::addColumn<QString>("before");
    QTest::addColumn<TextRange>("selection");
    QTest::addColumn<QString>("after");
    QTest::addColumn<TextRange>("range");
    QTest::addColumn<QString>("replacement");
    const auto row = [](const char *name, const char *before, TextRange selection, const char *after, TextRange range,
                        const char *replacement) {
        QTest::newRow(name) << QString::fromUtf8(before) << selection << QString::fromUtf8(after) << range
                            << QString::fromUtf8(replacement);
    };
    row("typed at the caret", "12", {1, 0}, "192", {1, 0}, "9");
    row("repeated digit at the caret", "11", {2, 0}, "111", {2, 0}, "1");
    row("typed over a selection", "128", {0, 3}, "1", {0, 3}, "1");
    row("pasted over what it resembles", "FF0000", {0, 6}, "#ff0000", {0, 6}, "#ff0000");
    row("pasted at the caret", "0061FD", {6, 0}, "0061FD#0061FD", {6, 0}, "#0061FD");
    row("deleted before the caret", "128", {2, 0}, "18", {1, 1}, "");
    row("selection deleted", "128", {1, 2}, "1", {1, 2}, "");
    row("changed elsewhere", "128", {3, 0}, "028", {0, 1}, "0");
    row("stale selection", "1", {5, 3}, "12", {1, 0}, "2");
    row("nothing", "128", {3, 0}, "128", {3, 0}, "");
}

void TextFieldRulesTest::editIsFoundOut()
{
    QFETCH(QString, before);
    QFETCH(TextRange, selection);
    QFETCH(QString, after);
    const auto edit = editBetween(before, selection, after);
    QTEST(edit.range, "range");
    QTEST(edit.replacement, "replacement");
    QCOMPARE(edited(before, edit), after);
}

void TextFieldRulesTest::questionIsAskedOncePerEdit()
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

QTEST_APPLESS_MAIN(TextFieldRulesTest)
#include "tst_textfieldrules.moc"
