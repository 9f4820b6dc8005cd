#include "service/preferredcontentsize.h"

#include <QTest>

using namespace favrin::service;
using namespace favrin::service::preferredcontentsize;

class TestPreferredContentSize : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void wideWindowsAreLandscapeExceptInAPopover_data();
    void wideWindowsAreLandscapeExceptInAPopover();
    void theHeightIsTheViewsOrElseTheWindows_data();
    void theHeightIsTheViewsOrElseTheWindows();
    void changesOfLessThanFifteenPointsAreDropped_data();
    void changesOfLessThanFifteenPointsAreDropped();
};

void TestPreferredContentSize::wideWindowsAreLandscapeExceptInAPopover_data()
{
    QTest::addColumn<QSizeF>("window");
    QTest::addColumn<bool>("popover");
    QTest::addColumn<bool>("landscape");
    QTest::newRow("tablet on its side") << QSizeF(1024, 768) << false << true;
    QTest::newRow("the same in a popover") << QSizeF(1024, 768) << true << false;
    QTest::newRow("upright") << QSizeF(768, 1024) << false << false;
    QTest::newRow("small") << QSizeF(420, 300) << false << false;
    QTest::newRow("450 is not enough") << QSizeF(450, 300) << false << false;
    QTest::newRow("just enough") << QSizeF(450.5, 300) << false << true;
    QTest::newRow("square") << QSizeF(800, 800) << false << false;
    QTest::newRow("no window yet") << QSizeF(0, 0) << false << false;
}

void TestPreferredContentSize::wideWindowsAreLandscapeExceptInAPopover()
{
    QFETCH(QSizeF, window);
    QFETCH(bool, popover);
    QTEST(isLandscape(window, popover ? Presentation::Popover : Presentation::Other), "landscape");
}

void TestPreferredContentSize::theHeightIsTheViewsOrElseTheWindows_data()
{
    QTest::addColumn<QSizeF>("intrinsic");
    QTest::addColumn<double>("height");
    QTest::newRow("intrinsic") << QSizeF(320, 512) << 512.0;
    QTest::newRow("no intrinsic width") << QSizeF(0, 512) << 700.0;
    QTest::newRow("no intrinsic metric") << QSizeF(-1, -1) << 700.0;
    QTest::newRow("width is not a number") << QSizeF(qQNaN(), 512) << 700.0;
    QTest::newRow("height is not a number") << QSizeF(320, qQNaN()) << 0.0;
    QTest::newRow("absurd height") << QSizeF(320, 1e12) << 16384.0;
}

void TestPreferredContentSize::theHeightIsTheViewsOrElseTheWindows()
{
    QFETCH(QSizeF, intrinsic);
    QFETCH(double, height);
    for (const bool landscape : {false, true}) {
        const QSizeF size = wanted(landscape, intrinsic, QSizeF(900, 700));
        QCOMPARE(size.width(), landscape ? 568.0 : 360.0);
        QCOMPARE(size.height(), height);
    }
}

void TestPreferredContentSize::changesOfLessThanFifteenPointsAreDropped_data()
{
    QTest::addColumn<QSizeF>("wantedSize");
    QTest::addColumn<bool>("changes");
    QTest::newRow("same") << QSizeF(360, 500) << false;
    QTest::newRow("10 taller") << QSizeF(360, 510) << false;
    QTest::newRow("almost 15 taller") << QSizeF(360, 514.99) << false;
    QTest::newRow("15 taller") << QSizeF(360, 515) << true;
    QTest::newRow("15 lower") << QSizeF(360, 485) << true;
    QTest::newRow("15 wider") << QSizeF(375, 500) << true;
    QTest::newRow("a little of both") << QSizeF(374, 514) << false;
}

void TestPreferredContentSize::changesOfLessThanFifteenPointsAreDropped()
{
    QFETCH(QSizeF, wantedSize);
    QTEST(isWorthChanging(QSizeF(360, 500), wantedSize), "changes");
}

QTEST_GUILESS_MAIN(TestPreferredContentSize)
#include "tst_preferredcontentsize.moc"
