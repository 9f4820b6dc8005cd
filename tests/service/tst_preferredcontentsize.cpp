#include "service/preferredcontentsize.h"

#include "../shared/table.h"

#include <QTest>

using namespace favrin::service;
using namespace favrin::service::preferredcontentsize;

class TestPreferredContentSize : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void wideWindowsAreLandscapeExceptInAPopover_data()
    {
        addRows<QSizeF, bool, bool>({
            {"tablet on its side", {1024, 768}, false, true},
            {"the same in a popover", {1024, 768}, true, false},
            {"upright", {768, 1024}, false, false},
            {"small", {420, 300}, false, false},
            {"450 is not enough", {450, 300}, false, false},
            {"just enough", {450.5, 300}, false, true},
            {"square", {800, 800}, false, false},
            {"no window yet", {0, 0}, false, false},
        });
    }
    void wideWindowsAreLandscapeExceptInAPopover()
    {
        const auto [window, popover, landscape] = row<QSizeF, bool, bool>();
        QCOMPARE(isLandscape(window, popover ? Presentation::Popover : Presentation::Other), landscape);
    }

    void theHeightIsTheViewsOrElseTheWindows_data()
    {
        addRows<QSizeF, double>({
            {"intrinsic", {320, 512}, 512.0},
            {"no intrinsic width", {0, 512}, 700.0},
            {"no intrinsic metric", {-1, -1}, 700.0},
            {"width is not a number", {qQNaN(), 512}, 700.0},
            {"height is not a number", {320, qQNaN()}, 0.0},
            {"absurd height", {320, 1e12}, 16384.0},
        });
    }
    void theHeightIsTheViewsOrElseTheWindows()
    {
        const auto [intrinsic, height] = row<QSizeF, double>();
        for (const bool landscape : {false, true}) {
            const QSizeF size = wanted(landscape, intrinsic, QSizeF(900, 700));
            QCOMPARE(size.width(), landscape ? 568.0 : 360.0);
            QCOMPARE(size.height(), height);
        }
    }

    void changesOfLessThanFifteenPointsAreDropped_data()
    {
        addRows<QSizeF, bool>({
            {"same", {360, 500}, false},
            {"10 taller", {360, 510}, false},
            {"almost 15 taller", {360, 514.99}, false},
            {"15 taller", {360, 515}, true},
            {"15 lower", {360, 485}, true},
            {"15 wider", {375, 500}, true},
            {"a little of both", {374, 514}, false},
        });
    }
    void changesOfLessThanFifteenPointsAreDropped()
    {
        const auto [wantedSize, changes] = row<QSizeF, bool>();
        QCOMPARE(isWorthChanging(QSizeF(360, 500), wantedSize), changes);
    }
};

QTEST_GUILESS_MAIN(TestPreferredContentSize)
#include "tst_preferredcontentsize.moc"
