#include "host/presentationlayout.h"

#include "../shared/table.h"

#include <QTest>

using namespace favrin::host;

/** Where a picker stands in windows of all sizes. */
class PresentationLayoutTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void panelStandsInTheWindow_data()
    {
        addRows<QSizeF, QSizeF, QRectF>({
            {"a phone: a sheet over the whole width", {390, 844}, {360, 600}, {0, 244, 390, 600}},
            {"a sheet that is higher than the window", {320, 480}, {360, 600}, {0, 0, 320, 480}},
            {"a tablet: a card in the middle", {768, 1024}, {360, 600}, {204, 212, 360, 600}},
            {"a card keeps a margin", {1024, 400}, {568, 600}, {228, 16, 568, 368}},
            {"whole points in odd windows", {901, 701}, {568, 515}, {166, 93, 568, 515}},
            {"no size asked for yet", {900, 700}, {0, 0}, {270, 70, 360, 560}},
            {"a window without a size", {0, 0}, {360, 600}, {0, -1, 0, 1}},
        });
    }
    void panelStandsInTheWindow()
    {
        const auto [window, preferred, panel] = row<QSizeF, QSizeF, QRectF>();
        const auto layout = layoutPresentation(PresentationStyle::Presented, window, preferred, {});
        QCOMPARE(layout.panel, panel);
        QCOMPARE(layout.arrowEdge, ArrowEdge::None);
    }

    void popoverPointsAtItsAnchor_data()
    {
        addRows<QRectF, ArrowEdge>({
            {"below a button at the top", {400, 20, 80, 30}, ArrowEdge::Top},
            {"above a button at the bottom", {400, 650, 80, 30}, ArrowEdge::Bottom},
            {"at the left edge", {0, 20, 30, 30}, ArrowEdge::Top},
            {"at the right edge", {870, 20, 30, 30}, ArrowEdge::Top},
            {"in the middle, with a little more room above", {400, 340, 80, 30}, ArrowEdge::Bottom},
        });
    }
    void popoverPointsAtItsAnchor()
    {
        const auto [anchor, edge] = row<QRectF, ArrowEdge>();
        const QRectF window(0, 0, 900, 700);
        const auto layout = layoutPresentation(PresentationStyle::Popover, window.size(), QSizeF(360, 500), anchor);
        QCOMPARE(layout.arrowEdge, edge);
        QVERIFY(window.contains(layout.panel));
        QVERIFY(!layout.panel.intersects(anchor));
        // The tip touches the anchor's edge, within the panel's straight part.
        QCOMPARE(layout.arrowTip.y(), layout.arrowEdge == ArrowEdge::Top ? anchor.bottom() : anchor.top());
        QVERIFY(layout.arrowTip.x() > layout.panel.left() + layout.topRadius);
        QVERIFY(layout.arrowTip.x() < layout.panel.right() - layout.topRadius);
    }
};

QTEST_APPLESS_MAIN(PresentationLayoutTest)
#include "tst_presentationlayout.moc"
