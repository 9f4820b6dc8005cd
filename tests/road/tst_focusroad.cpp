#include "roadtest.h"

namespace {

/** Two elements of the app, and between them a container for the picker. */
class HostWithElements : public RoadHost
{
public:
    HostWithElements()
    {
        before.setActiveFocusOnTab(true);
        place.setPosition(QPointF(30, 20));
        place.setSize(QSizeF(380, 640));
        after.setActiveFocusOnTab(true);
        window.requestActivate();
    }

    /** Tab as often as that, each when the one before can be seen to have moved the ring. */
    void tab(int times, Qt::Key key = Qt::Key_Tab)
    {
        for (int time = 0; time < times; ++time) {
            const QImage ring = window.grabWindow();
            QTest::keyClick(&window, key, key == Qt::Key_Backtab ? Qt::ShiftModifier : Qt::NoModifier);
            QTRY_VERIFY(window.grabWindow() != ring);
        }
    }

    QQuickItem before = QQuickItem(window.contentItem());
    QQuickItem place = QQuickItem(window.contentItem());
    QQuickItem after = QQuickItem(window.contentItem());
};

/** Eyedropper, tab picker, grid, track and field of the opacity, well, favorites. */
constexpr int stops = 7;

} // namespace

/** The keyboard focus on its way between the elements of an app and those of the picker. */
class FocusRoadTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void goesThroughAnEmbeddedPicker_data()
    {
        QTest::addColumn<bool>("forward");
        QTest::newRow("forward") << true;
        QTest::newRow("backward") << false;
    }

    void goesThroughAnEmbeddedPicker()
    {
        QFETCH(bool, forward);
        HostWithElements host;
        QVERIFY(host.embed(host.place));
        QQuickItem &start = forward ? host.before : host.after;
        QQuickItem &end = forward ? host.after : host.before;
        start.forceActiveFocus(Qt::TabFocusReason);
        const Qt::Key key = forward ? Qt::Key_Tab : Qt::Key_Backtab;
        host.tab(1, key);
        QVERIFY(host.picker.view()->hasActiveFocus());
        host.tab(stops - 1, key);
        // The last element has it still; one more leaves.
        QVERIFY(host.picker.view()->hasActiveFocus());
        host.tab(1, key);
        QTRY_VERIFY(end.hasActiveFocus());
        QVERIFY(host.picks.empty());
    }

    void entersWhereItComesFrom()
    {
        HostWithElements host;
        QVERIFY(host.embed(host.place));
        host.before.forceActiveFocus(Qt::TabFocusReason);
        host.tab(3);
        QTest::keyClick(&host.window, Qt::Key_Down);
        // The third element is the grid, whose keys pick; black, which is selected, is in its topmost row.
        QTRY_VERIFY(!host.picks.empty());
        const auto picks = host.picks.size();
        host.tab(5);
        QTRY_VERIFY(host.after.hasActiveFocus());
        host.tab(5, Qt::Key_Backtab);
        QTest::keyClick(&host.window, Qt::Key_Down);
        QTRY_VERIFY(host.picks.size() > picks);
    }

    void goesRoundWhereThereIsNothingElse()
    {
        HostWithElements host;
        host.before.setActiveFocusOnTab(false);
        host.after.setActiveFocusOnTab(false);
        QVERIFY(host.embed(host.place));
        // It has the focus from the start. The last element leads to the first, and that further on to the grid.
        QVERIFY(host.picker.view()->hasActiveFocus());
        host.tab(stops + 3);
        QTest::keyClick(&host.window, Qt::Key_Down);
        QTRY_VERIFY(!host.picks.empty());
        QVERIFY(host.picker.view()->hasActiveFocus());
    }

    void staysInAPresentedPicker()
    {
        HostWithElements host;
        host.before.forceActiveFocus();
        QVERIFY(host.present());
        // With the close button there is one more.
        host.tab(stops + 1 + 4);
        QTest::keyClick(&host.window, Qt::Key_Down);
        QTRY_VERIFY(!host.picks.empty());
        QVERIFY(host.picker.view()->hasActiveFocus());
        host.picker.dismiss();
        QTRY_COMPARE(host.finished.size(), 1);
        QVERIFY(host.before.hasActiveFocus());
    }

    void takesWhatIsTypedBeforeItHasItsKeyboard()
    {
        HostWithElements host;
        connect(&host.picker, &FVColorPickerViewController::stateChanged, &host.window, [&host] {
            if (!host.isReady())
                return;
            for (const Qt::Key key : {Qt::Key_Tab, Qt::Key_Tab, Qt::Key_Tab, Qt::Key_Tab, Qt::Key_Down})
                QTest::keyClick(&host.window, key);
        });
        host.picker.present(&host.window);
        // Close button, eyedropper, tab picker, and the grid, whose keys pick.
        QTRY_VERIFY(!host.picks.empty());
        QVERIFY(!host.picks.back().isVolatile);
    }
};

QTEST_MAIN(FocusRoadTest)
#include "tst_focusroad.moc"
