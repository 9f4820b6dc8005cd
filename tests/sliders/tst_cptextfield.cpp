#include "sliderswindow.h"

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

} // namespace

class CPTextFieldTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { QGuiApplication::clipboard()->clear(); }

    void numbersAreWrittenAtOnce()
    {
        SlidersWindow sliders;
        const auto *green = begin(sliders, Green);
        type(sliders, "999");
        QCOMPARE(sliders.color().g, 1.0);
        QCOMPARE(text(green), QStringLiteral("255"));
        const auto *opacity = begin(sliders, Opacity);
        paste(sliders, QStringLiteral("150"));
        QCOMPARE(sliders.color().a, 1.0);
        QCOMPARE(text(opacity), QStringLiteral("100%"));
        // An empty text is none, and does not stay.
        const SomeColor before = sliders.color();
        const auto *blue = begin(sliders, Blue);
        QTest::keyClick(&sliders.window, Qt::Key_Backspace);
        QCOMPARE(text(blue), QString());
        QCOMPARE(sliders.color(), before);
        const auto *red = begin(sliders, Red);
        QCOMPARE(text(blue), QStringLiteral("253"));
        // The field follows the color while it is edited.
        sliders.state.selectedColor.set(SomeColor(7 * unit, 0.0, 0.0, 1.0, Space::sRGB));
        QCOMPARE(text(red), QStringLiteral("7"));
        QTest::keyClick(&sliders.window, Qt::Key_Return);
        QVERIFY(!red->hasActiveFocus());
        // Keys still reach the picker.
        QVERIFY(sliders.view->isAncestorOf(sliders.window.activeFocusItem()));
    }

    void opacityKeepsTheCaretAtItsNumber()
    {
        SlidersWindow sliders;
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
        QCOMPARE(sliders.color().a, 0.05);
    }

    void opacityIsTypedOverItsSelection()
    {
        SlidersWindow sliders;
        auto *input = begin(sliders, Opacity);
        QMetaObject::invokeMethod(input, "select", Q_ARG(int, 0), Q_ARG(int, 3));
        type(sliders, "7");
        QCOMPARE(sliders.color().a, 0.07);
        QCOMPARE(text(input), QStringLiteral("7%"));
        QCOMPARE(caret(input), 1);
        type(sliders, "5");
        QCOMPARE(sliders.color().a, 0.75);
    }

    void hexKeepsItsTextWhileEdited()
    {
        SlidersWindow sliders;
        const auto *input = begin(sliders, Hex);
        const SomeColor odd(0.1 + 0.2, 1.0 / 3.0, 5e-324, 0.123456789012345678, Space::displayP3);
        sliders.state.selectedColor.set(odd);
        type(sliders, "AB");
        QCOMPARE(text(input), QStringLiteral("AB"));
        QCOMPARE(sliders.color(), odd);
        QTest::keyClick(&sliders.window, Qt::Key_Return);
        QCOMPARE(text(input), QStringLiteral("4D5500"));
        QCOMPARE(sliders.color(), odd);
        begin(sliders, Hex);
        type(sliders, "ff0000");
        QCOMPARE(sliders.color(), SomeColor(1.0, 0.0, 0.0, 1.0, Space::displayP3));
    }

    void pasteBringsAColor_data()
    {
        QTest::addColumn<bool>("allSelected");
        QTest::addColumn<QString>("pasted");
        QTest::addColumn<QString>("shown");
        QTest::newRow("plain") << true << "ff8000"
                               << "FF8000";
        QTest::newRow("with a sign") << true << "#FF8000"
                                     << "FF8000";
        QTest::newRow("CSS") << false << "rgb(255, 128, 0)"
                             << "FF8000";
        QTest::newRow("resembling what is there") << true << "#0061FE"
                                                  << "0061FE";
        QTest::newRow("at the caret") << false << "#FF8000"
                                      << "FF8000";
        QTest::newRow("blanks and opacity") << false << " FF800040\n"
                                            << "FF8000";
        QTest::newRow("name") << false << "Tomato"
                              << "FF6347";
        QTest::newRow("Display P3") << true << "color(display-p3 0.1569 0.3743 0.9561)"
                                    << "0061FD";
    }

    void pasteBringsAColor()
    {
        QFETCH(bool, allSelected);
        QFETCH(QString, pasted);
        QFETCH(QString, shown);
        SlidersWindow sliders;
        sliders.state.selectedColor.set(SomeColor(0.0, 97 * unit, 254 * unit, 0.5, Space::sRGB));
        auto *input = begin(sliders, Hex);
        if (!allSelected)
            QTest::keyClick(&sliders.window, Qt::Key_End);
        paste(sliders, pasted);
        QCOMPARE(text(input).toUpper(), shown);
        QCOMPARE(sliders.color().a, 1.0);
        QTest::keyClick(&sliders.window, Qt::Key_Return);
        QCOMPARE(text(input), shown);
    }

    void pasteOfAnythingElseChangesNothing_data()
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

    void pasteOfAnythingElseChangesNothing()
    {
        QFETCH(int, field);
        QFETCH(QString, pasted);
        SlidersWindow sliders;
        const auto *input = begin(sliders, Field(field));
        const QString shown = text(input);
        const SomeColor before = sliders.color();
        QSignalSpy writes(&sliders.state, &service::ColorPickerState::selectedColorChanged);
        paste(sliders, pasted);
        QCOMPARE(text(input), shown);
        QCOMPARE(writes.count(), 0);
        QCOMPARE(sliders.color(), before);
        // A refused edit leaves the next one its chance.
        input = begin(sliders, Field(field));
        type(sliders, "3");
        QVERIFY(text(input).startsWith(u'3'));
    }

    void copyOffersTextAndColor()
    {
        SlidersWindow sliders;
        sliders.state.selectedColor.set(sliders.color().inDisplayP3());
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

    void undoGoesBack()
    {
        SlidersWindow sliders;
        const auto *input = begin(sliders, Hex);
        type(sliders, "123");
        QTest::keySequence(&sliders.window, QKeySequence::Undo);
        QCOMPARE(text(input), QStringLiteral("0061FD"));
        QCOMPARE(sliders.color(), SomeColor(0.0, 97 * unit, 253 * unit, 1.0, Space::sRGB));
        type(sliders, "g");
        QVERIFY(!text(input).contains(u'g'));
    }

    void editingMakesTheFallbackASelection()
    {
        SlidersWindow sliders;
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

    void inputMethodIsFiltered()
    {
        SlidersWindow sliders;
        auto *input = begin(sliders, Red);
        const auto commit = [input](const QString &committed) {
            QInputMethodEvent event;
            event.setCommitString(committed);
            QCoreApplication::sendEvent(input, &event);
        };
        commit(QStringLiteral("12"));
        QCOMPARE(sliders.color().r, 12 * unit);
        commit(QStringLiteral("ab"));
        QCOMPARE(text(input), QStringLiteral("12"));
        commit(QStringLiteral("34"));
        QCOMPARE(text(input), QStringLiteral("12"));
        commit(QStringLiteral("3"));
        QCOMPARE(sliders.color().r, 123 * unit);
    }

    void doneBarOnAPhone()
    {
        SlidersWindow sliders;
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
        sliders.click(done);
        QVERIFY(!red->hasActiveFocus());
    }
};

QTEST_MAIN(CPTextFieldTest)
#include "tst_cptextfield.moc"
