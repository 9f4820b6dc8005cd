#include "gridwindow.h"

#include "platform/observation/publisher.h"
#include "theme/theme.h"

#include <QQmlComponent>
#include <QQmlEngine>

using namespace favrin;
using model::SomeColor;

namespace {

/** Everything written into the state from now on, in order. */
class Writes
{
public:
    explicit Writes(service::ColorPickerState &state)
        : m_flag(state.isVolatile.publisher().sink(
              [this](bool flag) { m_log << (flag ? QStringLiteral("volatile") : QStringLiteral("final")); }))
        , m_color(state.selectedColor.publisher().sink([this](const std::optional<SomeColor> &color) { add(color); }))
    {
        m_log.clear();
    }

    /** What was written since the last call. A color is the position of its swatch. */
    QString take() { return std::exchange(m_log, {}).join(u' '); }

private:
    void add(const std::optional<SomeColor> &color)
    {
        const auto cell = grid::markedCell(color, grid::defaultColorMatrix());
        m_log << (cell ? QStringLiteral("%1,%2").arg(cell->row).arg(cell->column) : QStringLiteral("other"));
    }

    QStringList m_log;
    platform::Subscription m_flag;
    platform::Subscription m_color;
};

} // namespace

class ColorSwatchPickerViewTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void touchWritesFlagThenColor();
    void cancelledTouchEndsTheGesture();
    void secondFingerDoesNotDisturb();
    void mouseDragsBeyondTheEdges();
    void otherMouseButtonsDoNothing();
    void keysPickFinally();
    void firstKeyStartsNearTheColor();
    void pickKeepsSpaceAndOpacity();
    void dragIsKeptInsideAFlickable_data();
    void dragIsKeptInsideAFlickable();
    void hidingEndsTheGesture();
    void neverMirrored();
    void darkPaletteIsPicked();
    void focusShowsForKeysOnly();

private:
    std::unique_ptr<QPointingDevice> m_touch{QTest::createTouchDevice()};
};

void ColorSwatchPickerViewTest::initTestCase()
{
    // Every move counts here; the toolkit would merge those of one frame.
    qputenv("QML_NO_TOUCH_COMPRESSION", "1");
}

void ColorSwatchPickerViewTest::init()
{
    theme::Theme::instance().setColorScheme(service::ColorScheme::Light);
}

void ColorSwatchPickerViewTest::touchWritesFlagThenColor()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
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

void ColorSwatchPickerViewTest::cancelledTouchEndsTheGesture()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    Writes writes(grid.state);
    QTest::touchEvent(&grid.window, m_touch.get()).press(0, GridWindow::middle(2, 3));
    writes.take();
    QTouchEvent cancel(QEvent::TouchCancel, m_touch.get());
    QCoreApplication::sendEvent(&grid.window, &cancel);
    QCOMPARE(writes.take(), QStringLiteral("final"));
    QTest::touchEvent(&grid.window, m_touch.get()).press(1, GridWindow::middle(4, 4));
    QCOMPARE(writes.take(), QStringLiteral("volatile 4,4"));
    QTest::touchEvent(&grid.window, m_touch.get()).release(1, GridWindow::middle(4, 4));
}

void ColorSwatchPickerViewTest::secondFingerDoesNotDisturb()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    Writes writes(grid.state);
    QTest::touchEvent(&grid.window, m_touch.get()).press(0, GridWindow::middle(2, 3));
    writes.take();
    QTest::touchEvent(&grid.window, m_touch.get()).stationary(0).press(1, GridWindow::middle(7, 7));
    QTest::touchEvent(&grid.window, m_touch.get()).stationary(0).move(1, GridWindow::middle(8, 8));
    QCOMPARE(writes.take(), QString());
    QTest::touchEvent(&grid.window, m_touch.get()).move(0, GridWindow::middle(2, 5)).stationary(1);
    QCOMPARE(writes.take(), QStringLiteral("volatile 2,5"));
    QTest::touchEvent(&grid.window, m_touch.get()).stationary(0).release(1, GridWindow::middle(8, 8));
    QCOMPARE(writes.take(), QString());
    QTest::touchEvent(&grid.window, m_touch.get()).release(0, GridWindow::middle(2, 5));
    QCOMPARE(writes.take(), QStringLiteral("final"));
}

void ColorSwatchPickerViewTest::mouseDragsBeyondTheEdges()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    Writes writes(grid.state);
    QTest::mousePress(&grid.window, Qt::LeftButton, {}, GridWindow::middle(0, 0));
    QTest::mouseMove(&grid.window, QPoint(399, 100));
    QTest::mouseRelease(&grid.window, Qt::LeftButton, {}, QPoint(399, 100));
    QCOMPARE(writes.take(), QStringLiteral("volatile 0,0 volatile 2,11 final"));
}

void ColorSwatchPickerViewTest::otherMouseButtonsDoNothing()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    Writes writes(grid.state);
    QTest::mouseClick(&grid.window, Qt::RightButton, {}, GridWindow::middle(3, 3));
    QCOMPARE(writes.take(), QString());
}

void ColorSwatchPickerViewTest::keysPickFinally()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
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

void ColorSwatchPickerViewTest::firstKeyStartsNearTheColor()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    grid.view->forceActiveFocus();
    SomeColor color = swatch(6, 7);
    color.b += 0.02;
    grid.state.selectedColor.set(color);
    Writes writes(grid.state);
    QTest::keyClick(&grid.window, Qt::Key_Left);
    QCOMPARE(writes.take(), QStringLiteral("6,7"));
}

void ColorSwatchPickerViewTest::pickKeepsSpaceAndOpacity()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    grid.state.selectedColor.set(SomeColor(0.2, 0.4, 0.6, 0.5, SomeColor::ColorSpace::displayP3));
    const SomeColor expected = swatch(5, 2).inDisplayP3().setting(SomeColor::Component::a, 0.5);
    QTest::mouseClick(&grid.window, Qt::LeftButton, {}, GridWindow::middle(5, 2));
    QCOMPARE(grid.state.selectedColor(), std::optional(expected));
    QCOMPARE(grid.view->markedCell(), std::optional(grid::CellPosition{5, 2}));
    QVERIFY(!grid.view->isSelected({5, 2}));
}

void ColorSwatchPickerViewTest::dragIsKeptInsideAFlickable_data()
{
    QTest::addColumn<bool>("byTouch");
    QTest::newRow("finger") << true;
    QTest::newRow("mouse") << false;
}

void ColorSwatchPickerViewTest::dragIsKeptInsideAFlickable()
{
    QFETCH(bool, byTouch);
    GridWindow grid;
    QQmlEngine engine;
    QQmlComponent component(&engine);
    component.setData("import QtQuick; Flickable { width: 400; height: 340; contentHeight: 900 }", {});
    std::unique_ptr<QQuickItem> flickable(qobject_cast<QQuickItem *>(component.create()));
    QVERIFY2(flickable, qPrintable(component.errorString()));
    flickable->setParentItem(grid.window.contentItem());
    grid.view->setParentItem(flickable->property("contentItem").value<QQuickItem *>());
    QVERIFY(grid.isReady());
    Writes writes(grid.state);

    if (byTouch) {
        QTest::touchEvent(&grid.window, m_touch.get()).press(0, GridWindow::middle(8, 3));
        for (int row = 7; row > 2; --row)
            QTest::touchEvent(&grid.window, m_touch.get()).move(0, GridWindow::middle(row, 3));
        QTest::touchEvent(&grid.window, m_touch.get()).release(0, GridWindow::middle(3, 3));
    } else {
        QTest::mousePress(&grid.window, Qt::LeftButton, {}, GridWindow::middle(8, 3));
        for (int row = 7; row > 2; --row)
            QTest::mouseMove(&grid.window, GridWindow::middle(row, 3));
        QTest::mouseRelease(&grid.window, Qt::LeftButton, {}, GridWindow::middle(3, 3));
    }
    QCOMPARE(writes.take(), QStringLiteral("volatile 8,3 volatile 7,3 volatile 6,3 volatile 5,3 volatile 4,3 "
                                           "volatile 3,3 final"));
    QCOMPARE(flickable->property("contentY").toDouble(), 0.0);
}

void ColorSwatchPickerViewTest::hidingEndsTheGesture()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    Writes writes(grid.state);
    QTest::touchEvent(&grid.window, m_touch.get()).press(0, GridWindow::middle(2, 3));
    writes.take();
    grid.view->setVisible(false);
    QCOMPARE(writes.take(), QStringLiteral("final"));
    QTest::touchEvent(&grid.window, m_touch.get()).release(0, GridWindow::middle(2, 3));
    QCOMPARE(writes.take(), QString());
}

void ColorSwatchPickerViewTest::neverMirrored()
{
    QGuiApplication::setLayoutDirection(Qt::RightToLeft);
    GridWindow grid;
    QVERIFY(grid.isReady());
    Writes writes(grid.state);
    QTest::mouseClick(&grid.window, Qt::LeftButton, {}, GridWindow::middle(3, 0));
    QTest::keyClick(&grid.window, Qt::Key_Right);
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    QCOMPARE(writes.take(), QStringLiteral("volatile 3,0 final 3,1"));
}

void ColorSwatchPickerViewTest::darkPaletteIsPicked()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    const SomeColor dark = grid::darkColorMatrix()[1][4];
    grid.state.selectedColor.set(dark);
    QVERIFY(grid.view->markedCell() != std::optional(grid::CellPosition{1, 4}));
    grid.state.enableDarkGrid.set(true);
    theme::Theme::instance().setColorScheme(service::ColorScheme::Dark);
    QCOMPARE(grid.view->markedCell(), std::optional(grid::CellPosition{1, 4}));
    QTest::mouseClick(&grid.window, Qt::LeftButton, {}, GridWindow::middle(9, 2));
    QCOMPARE(grid.state.selectedColor(), std::optional(grid::darkColorMatrix()[9][2]));
}

void ColorSwatchPickerViewTest::focusShowsForKeysOnly()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
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

QTEST_MAIN(ColorSwatchPickerViewTest)
#include "tst_colorswatchpickerview.moc"
