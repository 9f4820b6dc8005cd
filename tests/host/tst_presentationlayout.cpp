#include "host/presentationlayout.h"

#include <QTest>

using namespace favrin::host;

/** Where a picker stands in windows of all sizes. */
class PresentationLayoutTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void panelStandsInTheWindow_data();
    void panelStandsInTheWindow();
    void popoverPointsAtItsAnchor_data();
    void popoverPointsAtItsAnchor();
};

void PresentationLayoutTest::panelStandsInTheWindow_data()
{
    QTest::addColumn<QSizeF>("window");
    QTest::addColumn<QSizeF>("preferred");
    QTest::addColumn<QRectF>("panel");
    QTest::newRow("a phone: a sheet over the whole width")
        << QSizeF(390, 844) << QSizeF(360, 600) << QRectF(0, 244, 390, 600);
    QTest::newRow("a sheet that is higher than the window")
        << QSizeF(320, 480) << QSizeF(360, 600) << QRectF(0, 0, 320, 480);
    QTest::newRow("a tablet: a card in the middle")
        << QSizeF(768, 1024) << QSizeF(360, 600) << QRectF(204, 212, 360, 600);
    QTest::newRow("a card keeps a margin") << QSizeF(1024, 400) << QSizeF(568, 600) << QRectF(228, 16, 568, 368);
    QTest::newRow("whole points in odd windows") << QSizeF(901, 701) << QSizeF(568, 515) << QRectF(166, 93, 568, 515);
    QTest::newRow("no size asked for yet") << QSizeF(900, 700) << QSizeF(0, 0) << QRectF(270, 70, 360, 560);
    QTest::newRow("a window without a size") << QSizeF(0, 0) << QSizeF(360, 600) << QRectF(0, -1, 0, 1);
}

void PresentationLayoutTest::panelStandsInTheWindow()
{
    QFETCH(QSizeF, window);
    QFETCH(QSizeF, preferred);
    const auto layout = layoutPresentation(PresentationStyle::Presented, window, preferred, {});
    QTEST(layout.panel, "panel");
    QCOMPARE(layout.arrowEdge, ArrowEdge::None);
}

void PresentationLayoutTest::popoverPointsAtItsAnchor_data()
{
    QTest::addColumn<QRectF>("anchor");
    QTest::addColumn<ArrowEdge>("edge");
    QTest::newRow("below a button at the top") << QRectF(400, 20, 80, 30) << ArrowEdge::Top;
    QTest::newRow("above a button at the bottom") << QRectF(400, 650, 80, 30) << ArrowEdge::Bottom;
    QTest::newRow("at the left edge") << QRectF(0, 20, 30, 30) << ArrowEdge::Top;
    QTest::newRow("at the right edge") << QRectF(870, 20, 30, 30) << ArrowEdge::Top;
    QTest::newRow("in the middle, with a little more room above") << QRectF(400, 340, 80, 30) << ArrowEdge::Bottom;
}

void PresentationLayoutTest::popoverPointsAtItsAnchor()
{
    QFETCH(QRectF, anchor);
    const QRectF window(0, 0, 900, 700);
    const auto layout = layoutPresentation(PresentationStyle::Popover, window.size(), QSizeF(360, 500), anchor);
    QTEST(layout.arrowEdge, "edge");
    QVERIFY(window.contains(layout.panel));
    QVERIFY(!layout.panel.intersects(anchor));
    // The tip touches the anchor's edge, within the panel's straight part.
    QCOMPARE(layout.arrowTip.y(), layout.arrowEdge == ArrowEdge::Top ? anchor.bottom() : anchor.top());
    QVERIFY(layout.arrowTip.x() > layout.panel.left() + layout.topRadius);
    QVERIFY(layout.arrowTip.x() < layout.panel.right() - layout.topRadius);
}

QTEST_APPLESS_MAIN(PresentationLayoutTest)
#include "tst_presentationlayout.moc"
