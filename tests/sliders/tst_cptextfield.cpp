#include "sliderswindow.h"

#include "platform/observation/publisher.h"

#include <QClipboard>
#include <QColor>
#include <QGuiApplication>
#include <QMimeData>
#include <QSignalSpy>

using namespace favrin;
using model::SomeColor;
using Space = SomeColor::ColorSpace;

namespace {

enum Field { Red, Green, Blue, Hex, Opacity };

constexpr double unit = 1 / 255.0;

QString text(const QQuickItem *input)
{
    return input->property("text").toString();
}

int caret(const QQuickItem *input)
{
    return input->property("cursorPosition").toInt();
}

/** Gives a field the keyboard with everything selected, as Tab does. */
QQuickItem *begin(const SlidersWindow &sliders, Field field)
{
    auto *input = sliders.input(field);
    input->forceActiveFocus(Qt::TabFocusReason);
    return input;
}

void type(SlidersWindow &sliders, const char *keys)
{
    for (const char *key = keys; *key; ++key)
        QTest::keyClick(&sliders.window, *key);
}

void paste(SlidersWindow &sliders, const QString &text)
{
    QGuiApplication::clipboard()->setText(text);
    QTest::keySequence(&sliders.window, QKeySequence::Paste);
}

SomeColor color(const SlidersWindow &sliders)
{
    return sliders.state.selectedColor().value();
}

} // namespace

class CPTextFieldTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();
    void outOfRangeIsClampedAtOnce();
    void emptyTextWritesNothing();
    void fieldFollowsTheColorWhileEdited();
    void opacityKeepsTheCaretAtItsNumber();
    void opacityIsTypedOverItsSelection();
    void hexKeepsItsTextWhileEdited();
    void hexKeepsTheSpace();
    void pasteBringsAColor_data();
    void pasteBringsAColor();
    void pasteOfAnythingElseChangesNothing_data();
    void pasteOfAnythingElseChangesNothing();
    void copyOffersTextAndColor();
    void undoGoesBack();
    void editingMakesTheFallbackASelection();
    void returnEndsEditing();
    void inputMethodIsFiltered();
    void doneBarOnAPhone();
};

void CPTextFieldTest::cleanup()
{
    QGuiApplication::clipboard()->clear();
}

void CPTextFieldTest::outOfRangeIsClampedAtOnce()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const auto *green = begin(sliders, Green);
    type(sliders, "999");
    QCOMPARE(color(sliders).g, 1.0);
    QCOMPARE(text(green), QStringLiteral("255"));
    const auto *opacity = begin(sliders, Opacity);
    paste(sliders, QStringLiteral("150"));
    QCOMPARE(color(sliders).a, 1.0);
    QCOMPARE(text(opacity), QStringLiteral("100%"));
}

void CPTextFieldTest::emptyTextWritesNothing()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const SomeColor before = color(sliders);
    const auto *input = begin(sliders, Blue);
    QTest::keyClick(&sliders.window, Qt::Key_Backspace);
    QCOMPARE(text(input), QString());
    QCOMPARE(color(sliders), before);
    begin(sliders, Red);
    QCOMPARE(text(input), QStringLiteral("253"));
}

void CPTextFieldTest::fieldFollowsTheColorWhileEdited()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const auto *input = begin(sliders, Red);
    sliders.state.selectedColor.set(SomeColor(7 * unit, 0.0, 0.0, 1.0, Space::sRGB));
    QCOMPARE(text(input), QStringLiteral("7"));
}

void CPTextFieldTest::opacityKeepsTheCaretAtItsNumber()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    sliders.state.selectedColor.set(SomeColor(1.0, 0.0, 0.0, 0.5, Space::sRGB));
    auto *input = begin(sliders, Opacity);
    QCOMPARE(input->property("selectedText").toString(), QStringLiteral("50%"));
    QTest::keyClick(&sliders.window, Qt::Key_End);
    QCOMPARE(caret(input), 2);
    QTest::keyClick(&sliders.window, Qt::Key_Right);
    QCOMPARE(caret(input), 2);
    QTest::keyClick(&sliders.window, Qt::Key_Home);
    QCOMPARE(caret(input), 0);
    input->setProperty("cursorPosition", 3);
    QCOMPARE(caret(input), 2);
    // The number is what Backspace takes, not the sign.
    QTest::keyClick(&sliders.window, Qt::Key_Backspace);
    QCOMPARE(text(input), QStringLiteral("5%"));
    QCOMPARE(color(sliders).a, 0.05);
}

void CPTextFieldTest::opacityIsTypedOverItsSelection()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    auto *input = begin(sliders, Opacity);
    QMetaObject::invokeMethod(input, "select", Q_ARG(int, 0), Q_ARG(int, 3));
    type(sliders, "7");
    QCOMPARE(color(sliders).a, 0.07);
    QCOMPARE(text(input), QStringLiteral("7%"));
    QCOMPARE(caret(input), 1);
    type(sliders, "5");
    QCOMPARE(color(sliders).a, 0.75);
}

void CPTextFieldTest::hexKeepsItsTextWhileEdited()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const auto *input = begin(sliders, Hex);
    type(sliders, "AB");
    sliders.state.selectedColor.set(SomeColor(1.0, 1.0, 1.0, 1.0, Space::sRGB));
    QCOMPARE(text(input), QStringLiteral("AB"));
    QTest::keyClick(&sliders.window, Qt::Key_Return);
    QCOMPARE(text(input), QStringLiteral("FFFFFF"));
}

void CPTextFieldTest::hexKeepsTheSpace()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    sliders.state.selectedColor.set(color(sliders).inDisplayP3());
    const auto *input = begin(sliders, Hex);
    QCOMPARE(text(input), QStringLiteral("285FF4"));
    type(sliders, "ff0000");
    QCOMPARE(color(sliders), SomeColor(1.0, 0.0, 0.0, 1.0, Space::displayP3));
}

void CPTextFieldTest::pasteBringsAColor_data()
{
    QTest::addColumn<bool>("allSelected");
    QTest::addColumn<QString>("pasted");
    QTest::addColumn<QString>("shown");
    QTest::newRow("plain") << true << QStringLiteral("ff8000") << QStringLiteral("FF8000");
    QTest::newRow("with a sign") << true << QStringLiteral("#FF8000") << QStringLiteral("FF8000");
    QTest::newRow("resembling what is there") << true << QStringLiteral("#0061FE") << QStringLiteral("0061FE");
    QTest::newRow("at the caret") << false << QStringLiteral("#FF8000") << QStringLiteral("FF8000");
    QTest::newRow("blanks and opacity") << false << QStringLiteral(" FF800040\n") << QStringLiteral("FF8000");
    QTest::newRow("CSS") << false << QStringLiteral("rgb(255, 128, 0)") << QStringLiteral("FF8000");
    QTest::newRow("name") << false << QStringLiteral("Tomato") << QStringLiteral("FF6347");
    QTest::newRow("Display P3") << true << QStringLiteral("color(display-p3 0.1569 0.3743 0.9561)")
                                << QStringLiteral("0061FD");
}

void CPTextFieldTest::pasteBringsAColor()
{
    QFETCH(bool, allSelected);
    QFETCH(QString, pasted);
    QFETCH(QString, shown);
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    sliders.state.selectedColor.set(SomeColor(0.0, 97 * unit, 254 * unit, 0.5, Space::sRGB));
    auto *input = begin(sliders, Hex);
    if (!allSelected)
        QTest::keyClick(&sliders.window, Qt::Key_End);
    paste(sliders, pasted);
    QCOMPARE(text(input).toUpper(), shown);
    QCOMPARE(color(sliders).a, 1.0);
    QTest::keyClick(&sliders.window, Qt::Key_Return);
    QCOMPARE(text(input), shown);
}

void CPTextFieldTest::pasteOfAnythingElseChangesNothing_data()
{
    QTest::addColumn<int>("field");
    QTest::addColumn<QString>("pasted");
    for (const char *pasted : {"hello", "#12345", "rgb(1,2)", "#", "🎨", "\n"})
        QTest::addRow("hex: %s", pasted) << int(Hex) << QString::fromUtf8(pasted);
    for (const char *pasted : {"#FF0000", "-1", "1000", "12.5", "red", "\n"})
        QTest::addRow("red: %s", pasted) << int(Red) << QString::fromUtf8(pasted);
    for (const char *pasted : {"50 pct", "-1", "0.5"})
        QTest::addRow("opacity: %s", pasted) << int(Opacity) << QString::fromUtf8(pasted);
}

void CPTextFieldTest::pasteOfAnythingElseChangesNothing()
{
    QFETCH(int, field);
    QFETCH(QString, pasted);
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const auto *input = begin(sliders, Field(field));
    const QString shown = text(input);
    const SomeColor before = color(sliders);
    QSignalSpy writes(&sliders.state, &service::ColorPickerState::selectedColorChanged);
    paste(sliders, pasted);
    QCOMPARE(text(input), shown);
    QCOMPARE(writes.count(), 0);
    QCOMPARE(color(sliders), before);
    // A refused edit leaves the next one its chance.
    input = begin(sliders, Field(field));
    type(sliders, "3");
    QVERIFY(text(input).startsWith(u'3'));
}

void CPTextFieldTest::copyOffersTextAndColor()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    sliders.state.selectedColor.set(color(sliders).inDisplayP3());
    begin(sliders, Hex);
    QTest::keySequence(&sliders.window, QKeySequence::Copy);
    const auto *data = QGuiApplication::clipboard()->mimeData();
    QCOMPARE(data->text(), QStringLiteral("285FF4"));
    QVERIFY(data->hasColor());
    // The desktop's form knows sRGB only.
    const auto copied = data->colorData().value<QColor>();
    QVERIFY(std::abs(copied.greenF() - 97 * unit) < 0.003);
    QVERIFY(std::abs(copied.blueF() - 253 * unit) < 0.003);

    type(sliders, "12");
    QTest::keySequence(&sliders.window, QKeySequence::SelectAll);
    QTest::keySequence(&sliders.window, QKeySequence::Copy);
    QCOMPARE(QGuiApplication::clipboard()->text(), QStringLiteral("12"));
    QVERIFY(!QGuiApplication::clipboard()->mimeData()->hasColor());
}

void CPTextFieldTest::undoGoesBack()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const auto *input = begin(sliders, Hex);
    type(sliders, "123");
    QTest::keySequence(&sliders.window, QKeySequence::Undo);
    QCOMPARE(text(input), QStringLiteral("0061FD"));
    QCOMPARE(color(sliders), SomeColor(0.0, 97 * unit, 253 * unit, 1.0, Space::sRGB));
    type(sliders, "g");
    QVERIFY(!text(input).contains(u'g'));
}

void CPTextFieldTest::editingMakesTheFallbackASelection()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const SomeColor fallback(0.2, 0.4, 0.6, 0.8, Space::sRGB);
    sliders.state.fallbackColor.set(fallback);
    sliders.state.selectedColor.set(std::nullopt);
    const auto *input = sliders.input(Hex);
    QCOMPARE(text(input), QStringLiteral("336699"));
    QCOMPARE(input->property("color").value<QColor>(), theme::Theme::instance().tertiaryLabel());
    begin(sliders, Hex);
    QCOMPARE(sliders.state.selectedColor(), std::optional(fallback));
    QCOMPARE(input->property("color").value<QColor>(), theme::Theme::instance().label());
}

void CPTextFieldTest::returnEndsEditing()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const auto *input = begin(sliders, Red);
    QTest::keyClick(&sliders.window, Qt::Key_Return);
    QVERIFY(!input->hasActiveFocus());
    // Keys still reach the picker.
    QVERIFY(sliders.view->isAncestorOf(sliders.window.activeFocusItem()));
}

void CPTextFieldTest::inputMethodIsFiltered()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    auto *input = begin(sliders, Red);
    const auto commit = [input](const QString &committed) {
        QInputMethodEvent event;
        event.setCommitString(committed);
        QCoreApplication::sendEvent(input, &event);
    };
    commit(QStringLiteral("12"));
    QCOMPARE(color(sliders).r, 12 * unit);
    commit(QStringLiteral("ab"));
    QCOMPARE(text(input), QStringLiteral("12"));
    commit(QStringLiteral("34"));
    QCOMPARE(text(input), QStringLiteral("12"));
    commit(QStringLiteral("3"));
    QCOMPARE(color(sliders).r, 123 * unit);
}

void CPTextFieldTest::doneBarOnAPhone()
{
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    const auto doneButton = [&sliders]() -> QQuickItem * {
        for (auto *item : itemsBelow(sliders.window.contentItem())) {
            if (item->inherits("QQuickAbstractButton") && item->width() < 120 && item->height() == 44)
                return item;
        }
        return nullptr;
    };
    for (const Field field : {Red, Hex}) {
        sliders.input(field)->parentItem()->setProperty("isPhone", true);
        sliders.input(field)->parentItem()->setProperty("isKeyboardVisible", true);
    }
    begin(sliders, Hex);
    QVERIFY(!doneButton());
    const auto *red = begin(sliders, Red);
    auto *done = doneButton();
    QVERIFY(done);
    QTest::mouseClick(&sliders.window, Qt::LeftButton, {}, SlidersWindow::at(done, done->width() / 2));
    QVERIFY(!red->hasActiveFocus());
}

QTEST_MAIN(CPTextFieldTest)
#include "tst_cptextfield.moc"
