#include "gridwindow.h"

#include "../shared/statewrites.h"
#include "theme/theme.h"

using namespace favrin;
using model::SomeColor;

namespace {

/** A color is the position of its swatch. */
struct Writes : StateWrites
{
    explicit Writes(service::ColorPickerState &state)
        : StateWrites(state, [](const OptionalColor &color) {
            const auto cell = grid::markedCell(color, grid::defaultColorMatrix());
            return cell ? QStringLiteral("%1,%2").arg(cell->row).arg(cell->column) : QStringLiteral("other");
        })
    {
    }
};

} // namespace

class ColorSwatchPickerViewTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        // Every move counts here; the toolkit would merge those of one frame.
        qputenv("QML_NO_TOUCH_COMPRESSION", "1");
    }

    void init() { theme::Theme::instance().setColorScheme(service::ColorScheme::Light); }

    void touchWritesFlagThenColor()
    {
        GridWindow grid;
        Writes writes(grid.state);
        QTest::touchEvent(&grid.window, m_touch.get()).press(0, GridWindow::middle(2, 3));
        QCOMPARE(writes.take(), QStringLiteral("volatile 2,3"));
        QTest::touchEvent(&grid.window, m_touch.get()).move(0, GridWindow::middle(2, 4));
        QCOMPARE(writes.take(), QStringLiteral("volatile 2,4"));
        QTest::touchEvent(&grid.window, m_touch.get()).move(0, QPoint(-100, 5000));
        QCOMPARE(writes.take(), QStringLiteral("volatile 9,0"));
        QTest::touchEvent(&grid.window, m_touch.get()).release(0, GridWindow::middle(5, 5));
        QCOMPARE(writes.take(), QStringLiteral("final"));
        QCOMPARE(grid.state.selectedColor(), std::optional(swatch(9, 0)));
    }

    void keysPickFinally()
    {
        GridWindow grid;
        grid.view->forceActiveFocus();
        Writes writes(grid.state);
        QTest::keyClick(&grid.window, Qt::Key_Down);
        QCOMPARE(writes.take(), QStringLiteral("0,0"));
        QTest::keyClick(&grid.window, Qt::Key_Down);
        QTest::keyClick(&grid.window, Qt::Key_End);
        QCOMPARE(writes.take(), QStringLiteral("1,0 1,11"));
        QTest::keyClick(&grid.window, Qt::Key_Right);
        QCOMPARE(writes.take(), QString());
    }

    void firstKeyStartsNearTheColor()
    {
        GridWindow grid;
        grid.view->forceActiveFocus();
        SomeColor color = swatch(6, 7);
        color.b += 0.02;
        grid.state.selectedColor.set(color);
        Writes writes(grid.state);
        QTest::keyClick(&grid.window, Qt::Key_Left);
        QCOMPARE(writes.take(), QStringLiteral("6,7"));
    }

    void pickKeepsSpaceAndOpacity()
    {
        GridWindow grid;
        grid.state.selectedColor.set(SomeColor(0.2, 0.4, 0.6, 0.5, SomeColor::ColorSpace::displayP3));
        const SomeColor expected = swatch(5, 2).inDisplayP3().setting(SomeColor::Component::a, 0.5);
        QTest::mouseClick(&grid.window, Qt::LeftButton, {}, GridWindow::middle(5, 2));
        QCOMPARE(grid.state.selectedColor(), std::optional(expected));
        QCOMPARE(grid.view->markedCell(), std::optional(grid::CellPosition{5, 2}));
        QVERIFY(!grid.view->isSelected({5, 2}));
    }

    void hidingEndsTheGesture()
    {
        GridWindow grid;
        Writes writes(grid.state);
        QTest::touchEvent(&grid.window, m_touch.get()).press(0, GridWindow::middle(2, 3));
        writes.take();
        grid.view->setVisible(false);
        QCOMPARE(writes.take(), QStringLiteral("final"));
        QTest::touchEvent(&grid.window, m_touch.get()).release(0, GridWindow::middle(2, 3));
        QCOMPARE(writes.take(), QString());
    }

    void neverMirrored()
    {
        QGuiApplication::setLayoutDirection(Qt::RightToLeft);
        GridWindow grid;
        Writes writes(grid.state);
        QTest::mouseClick(&grid.window, Qt::LeftButton, {}, GridWindow::middle(3, 0));
        QTest::keyClick(&grid.window, Qt::Key_Right);
        QGuiApplication::setLayoutDirection(Qt::LeftToRight);
        QCOMPARE(writes.take(), QStringLiteral("volatile 3,0 final 3,1"));
    }

    void darkPaletteIsPicked()
    {
        GridWindow grid;
        const SomeColor dark = grid::darkColorMatrix()[1][4];
        grid.state.selectedColor.set(dark);
        QVERIFY(grid.view->markedCell() != std::optional(grid::CellPosition{1, 4}));
        grid.state.enableDarkGrid.set(true);
        theme::Theme::instance().setColorScheme(service::ColorScheme::Dark);
        QCOMPARE(grid.view->markedCell(), std::optional(grid::CellPosition{1, 4}));
        QTest::mouseClick(&grid.window, Qt::LeftButton, {}, GridWindow::middle(9, 2));
        QCOMPARE(grid.state.selectedColor(), std::optional(grid::darkColorMatrix()[9][2]));
    }

    void focusShowsForKeysOnly()
    {
        GridWindow grid;
        QTest::mouseClick(&grid.window, Qt::LeftButton, {}, GridWindow::middle(3, 3));
        QVERIFY(grid.view->hasActiveFocus());
        QVERIFY(!grid.view->focusVisible());
        QTest::keyClick(&grid.window, Qt::Key_Up);
        QVERIFY(grid.view->focusVisible());
        grid.view->setFocus(false);
        QVERIFY(!grid.view->focusVisible());
        QTest::keyClick(&grid.window, Qt::Key_Tab);
        QVERIFY(grid.view->focusVisible());
    }

private:
    std::unique_ptr<QPointingDevice> m_touch{QTest::createTouchDevice()};
};

QTEST_MAIN(ColorSwatchPickerViewTest)
#include "tst_colorswatchpickerview.moc"
