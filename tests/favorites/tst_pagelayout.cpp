#include "favorites/pagedots.h"
#include "favorites/pagelayout.h"
#include "favorites/stripkeys.h"

#include <QTest>

#include <limits>

using namespace favrin;
using favorites::ColorItem;
using favorites::ItemList;
using favorites::PageLayout;

namespace {

const favorites::SwatchMetrics portrait = favorites::swatchMetrics(false);
const favorites::SwatchMetrics landscape = favorites::swatchMetrics(true);

/** f favorite, . filler, s suggested, + add. */
ItemList items(const QString &kinds)
{
    const model::SomeColor color(0.0, 0.0, 0.0, 1.0, model::SomeColor::ColorSpace::sRGB);
    ItemList list;
    for (const QChar kind : kinds) {
        const int number = static_cast<int>(list.size());
        list.push_back(kind == u'.'   ? ColorItem::filler(number)
                       : kind == u's' ? ColorItem::suggestedColor(color, number)
                       : kind == u'+' ? ColorItem::addButton()
                                      : ColorItem::favoriteColor(color, number));
    }
    return list;
}

} // namespace

class PageLayoutTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void stripFits_data();
    void stripFits();
    void itemsFillPagesRowByRow();
    void everyPointFindsItsItem();
    void pageIsNamedRightHoweverFarOut();
    void dragComesToRest_data();
    void dragComesToRest();
    void visiblePlaces_data();
    void visiblePlaces();
    void keysLeadTo_data();
    void keysLeadTo();
    void dotsAreShown_data();
    void dotsAreShown();
    void pointsAndDragsNamePages();
};

void PageLayoutTest::stripFits_data()
{
    QTest::addColumn<double>("width");
    QTest::addColumn<bool>("isLandscape");
    QTest::addColumn<int>("swatchesPerPage");
    QTest::addColumn<double>("inset");
    QTest::newRow("usual") << 200.0 << false << 8 << 13.0;
    QTest::newRow("narrower than the least") << 40.0 << false << 2 << 10.0;
    QTest::newRow("the least") << 50.0 << false << 2 << 10.0;
    QTest::newRow("just enough for one more") << 222.0 << false << 10 << 0.0;
    QTest::newRow("just too little for one more") << 221.0 << false << 8 << 23.5;
    QTest::newRow("no more than sixteen") << 1000.0 << false << 16 << 317.0;
    QTest::newRow("landscape") << 200.0 << true << 8 << 20.0;
    QTest::newRow("nothing") << 0.0 << true << 2 << 11.0;
    QTest::newRow("no number") << std::numeric_limits<double>::quiet_NaN() << false << 2 << 10.0;
}

void PageLayoutTest::stripFits()
{
    QFETCH(double, width);
    QFETCH(bool, isLandscape);
    QFETCH(int, swatchesPerPage);
    QFETCH(double, inset);
    const auto fit = favorites::stripFit(width, favorites::swatchMetrics(isLandscape));
    QCOMPARE(fit.swatchesPerPage, swatchesPerPage);
    QCOMPARE(fit.inset, inset);
}

void PageLayoutTest::itemsFillPagesRowByRow()
{
    const PageLayout layout(portrait, 8);
    QCOMPARE(layout.pageSize(), QSizeF(174.0, 78.0));
    QCOMPARE(layout.frame(0), QRectF(0.0, 0.0, 30.0, 30.0));
    QCOMPARE(layout.frame(3), QRectF(144.0, 0.0, 30.0, 30.0));
    QCOMPARE(layout.frame(4), QRectF(0.0, 48.0, 30.0, 30.0));
    QCOMPARE(layout.frame(8), QRectF(192.0, 0.0, 30.0, 30.0));
    QCOMPARE(layout.frame(8 * 1000 + 7).left(), 1000 * 192.0 + 144.0);
    QCOMPARE(PageLayout(landscape, 8).frame(5), QRectF(44.0, 44.0, 28.0, 28.0));
    QCOMPARE(layout.pageCount(0), 0);
    QCOMPARE(layout.pageCount(8), 1);
    QCOMPARE(layout.pageCount(9), 2);
    QCOMPARE(layout.contentWidth(9), 174.0 + 18.0 + 174.0);
}

void PageLayoutTest::everyPointFindsItsItem()
{
    const PageLayout layout(portrait, 6);
    const int count = 100;
    for (int place = 0; place < count; ++place) {
        const QRectF frame = layout.frame(place);
        QCOMPARE(layout.placeAt(frame.center(), count), std::optional(place));
        QCOMPARE(layout.placeAt(frame.topLeft() + QPointF(0.5, 0.5), count), std::optional(place));
        QCOMPARE(layout.placeAt(frame.bottomRight() + QPointF(6.0, -2.0), count), std::optional(place));
        QCOMPARE(layout.placeAt(frame.topLeft() + QPointF(-6.0, 2.0), count), std::optional(place));
        QCOMPARE(layout.placeAt(frame.bottomRight() + QPointF(9.0, -2.0), count), std::nullopt);
        QCOMPARE(layout.placeAt(frame.center(), place), std::nullopt);
    }
    QCOMPARE(layout.placeAt(QPointF(-9.0, 5.0), count), std::nullopt);
    QCOMPARE(layout.placeAt(QPointF(5.0, -9.0), count), std::nullopt);
    QCOMPARE(layout.placeAt(QPointF(1.0e300, 5.0), count), std::nullopt);
}

void PageLayoutTest::pageIsNamedRightHoweverFarOut()
{
    for (const int perPage : {2, 8, 12, 16}) {
        const PageLayout layout(portrait, perPage);
        const int count = 10'000;
        for (int page = 0; page < layout.pageCount(count); ++page) {
            // Pixels may have rounded the offset.
            for (const double off : {0.0, 0.5, -0.5})
                QCOMPARE(layout.pageAt(layout.offsetOf(page) + off, count), page);
        }
        QCOMPARE(layout.pageAt(-200.0, count), 0);
        QCOMPARE(layout.pageAt(1.0e300, count), layout.pageCount(count) - 1);
        QCOMPARE(layout.pageAt(50.0, 0), 0);
    }
}

void PageLayoutTest::dragComesToRest_data()
{
    QTest::addColumn<double>("offset");
    QTest::addColumn<double>("velocity");
    QTest::addColumn<int>("page");
    // From page 2 of 5, pages 192 apart.
    QTest::newRow("slow and short stays") << 2 * 192.0 + 80 << 10.0 << 2;
    QTest::newRow("slow and far turns") << 2 * 192.0 + 120 << 10.0 << 3;
    QTest::newRow("quick and short turns") << 2 * 192.0 + 20 << 400.0 << 3;
    QTest::newRow("quick back") << 2 * 192.0 - 20 << -400.0 << 1;
    QTest::newRow("very quick turns but one") << 3 * 192.0 << 9000.0 << 3;
    QTest::newRow("flung back at the end stays") << 2 * 192.0 + 60 << -400.0 << 1;
}

void PageLayoutTest::dragComesToRest()
{
    QFETCH(double, offset);
    QFETCH(double, velocity);
    QFETCH(int, page);
    const PageLayout layout(portrait, 8);
    QCOMPARE(layout.restingPage(offset, velocity, 2, 40), page);
    QCOMPARE(layout.restingPage(900.0, 900.0, 4, 40), 4);
    QCOMPARE(layout.restingPage(-50.0, -900.0, 0, 40), 0);
    QCOMPARE(layout.restingPage(0.0, 900.0, 0, 0), 0);
}

void PageLayoutTest::visiblePlaces_data()
{
    QTest::addColumn<double>("offset");
    QTest::addColumn<int>("first");
    QTest::addColumn<int>("end");
    QTest::newRow("at rest") << 192.0 << 8 << 16;
    QTest::newRow("between") << 220.0 << 8 << 21;
    QTest::newRow("just leaving") << 192.0 - 10.0 << 8 << 16;
    QTest::newRow("last") << 2 * 192.0 << 16 << 21;
    QTest::newRow("beyond the start") << -60.0 << 0 << 8;
    QTest::newRow("beyond the end") << 2 * 192.0 + 60.0 << 16 << 21;
    QTest::newRow("far beyond") << 1.0e9 << 16 << 21;
}

void PageLayoutTest::visiblePlaces()
{
    QFETCH(double, offset);
    QFETCH(int, first);
    QFETCH(int, end);
    QCOMPARE(PageLayout(portrait, 8).visiblePlaces(offset, 21), std::pair(first, end));
    QCOMPARE(PageLayout(portrait, 8).visiblePlaces(offset, 0), std::pair(0, 0));
}

void PageLayoutTest::keysLeadTo_data()
{
    QTest::addColumn<QString>("kinds");
    QTest::addColumn<int>("from");
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("to");
    QTest::addColumn<int>("mirroredTo");
    // Pages of two rows of three.
    const QString plain = QStringLiteral("fffffffffffff+");
    const QString filled = QStringLiteral("ss....fff+");
    const QString filledPage = QStringLiteral("ssssss......ff+");
    const auto row = [](const char *name, const QString &kinds, int from, Qt::Key key, int to, int mirrored) {
        QTest::newRow(name) << kinds << from << int(key) << to << mirrored;
    };
    row("on", plain, 2, Qt::Key_Right, 3, 1);
    row("back", plain, 2, Qt::Key_Left, 1, 3);
    row("on to the next page", plain, 5, Qt::Key_Right, 6, 4);
    row("not before the first", plain, 0, Qt::Key_Left, 0, 1);
    row("not behind the last", plain, 13, Qt::Key_Right, 13, 12);
    row("down", plain, 1, Qt::Key_Down, 4, 4);
    row("not down to the next page", plain, 4, Qt::Key_Down, 4, 4);
    row("not down to nothing", plain, 12, Qt::Key_Down, 12, 12);
    row("up", plain, 10, Qt::Key_Up, 7, 7);
    row("page on", plain, 4, Qt::Key_PageDown, 10, 10);
    row("page on to the last item", plain, 10, Qt::Key_PageDown, 13, 13);
    row("no page on", plain, 13, Qt::Key_PageDown, 13, 13);
    row("page back", plain, 13, Qt::Key_PageUp, 7, 7);
    row("no page back", plain, 4, Qt::Key_PageUp, 4, 4);
    row("first", plain, 9, Qt::Key_Home, 0, 0);
    row("last", plain, 9, Qt::Key_End, 13, 13);
    row("over fillers", filled, 1, Qt::Key_Right, 6, 0);
    row("back over fillers", filled, 6, Qt::Key_Left, 1, 7);
    row("not down to a filler", filled, 1, Qt::Key_Down, 1, 1);
    row("over a page of fillers", filledPage, 2, Qt::Key_PageDown, 12, 12);
    row("back over a page of fillers", filledPage, 13, Qt::Key_PageUp, 5, 5);
    row("other keys", plain, 3, Qt::Key_A, -1, -1);
}

void PageLayoutTest::keysLeadTo()
{
    QFETCH(QString, kinds);
    QFETCH(int, from);
    QFETCH(int, key);
    QFETCH(int, to);
    QFETCH(int, mirroredTo);
    const PageLayout layout(portrait, 6);
    QCOMPARE(favorites::placeForKey(key, items(kinds), layout, from, Qt::LeftToRight).value_or(-1), to);
    QCOMPARE(favorites::placeForKey(key, items(kinds), layout, from, Qt::RightToLeft).value_or(-1), mirroredTo);
}

void PageLayoutTest::dotsAreShown_data()
{
    QTest::addColumn<int>("pages");
    QTest::addColumn<int>("current");
    QTest::addColumn<double>("width");
    QTest::addColumn<int>("first");
    QTest::addColumn<int>("count");
    QTest::newRow("all") << 4 << 2 << 300.0 << 0 << 4;
    QTest::newRow("no pages") << 0 << 0 << 300.0 << 0 << 0;
    QTest::newRow("no room for all") << 9 << 0 << 80.0 << 0 << 5;
    QTest::newRow("around the current") << 9 << 5 << 80.0 << 3 << 5;
    QTest::newRow("at the end") << 9 << 8 << 80.0 << 4 << 5;
    QTest::newRow("very many") << 834 << 400 << 300.0 << 395 << 11;
    QTest::newRow("no room at all") << 9 << 5 << 0.0 << 5 << 1;
}

void PageLayoutTest::dotsAreShown()
{
    QFETCH(int, pages);
    QFETCH(int, current);
    QFETCH(double, width);
    QFETCH(int, first);
    QFETCH(int, count);
    const auto dots = favorites::pageDots(pages, current, width);
    QCOMPARE(static_cast<int>(dots.size()), count);
    for (int dot = 0; dot < count; ++dot)
        QCOMPARE(dots[static_cast<std::size_t>(dot)].page, first + dot);
    if (count == 0)
        return;
    QCOMPARE(dots.front().center + dots.back().center, width);
    // Small at exactly those ends beyond which there is more; the current one never.
    QCOMPARE(dots.front().scale<1.0, first> 0 && first != current);
    QCOMPARE(dots.back().scale < 1.0, first + count < pages && dots.back().page != current);
}

void PageLayoutTest::pointsAndDragsNamePages()
{
    for (const auto &dot : favorites::pageDots(834, 400, 300.0))
        QCOMPARE(favorites::pageAtPosition(dot.center + 5.0, 834, 400, 300.0), dot.page);
    QCOMPARE(favorites::pageAtPosition(-50.0, 4, 2, 300.0), 0);
    QCOMPARE(favorites::pageAtPosition(900.0, 4, 2, 300.0), 3);
    QCOMPARE(favorites::pageAtPosition(900.0, 0, 0, 300.0), 0);
    QCOMPARE(favorites::pageAfterDrag(20.0, 1, 4, 300.0), 2);
    QCOMPARE(favorites::pageAfterDrag(-500.0, 1, 4, 300.0), 0);
    // However many pages there are, a drag along all dots leads through all of them.
    QCOMPARE(favorites::pageAfterDrag(11 * 16.0, 0, 834, 300.0), 833);
}

QTEST_GUILESS_MAIN(PageLayoutTest)
#include "tst_pagelayout.moc"
