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
ItemList items(const char *kinds)
{
    const model::SomeColor color(0.0, 0.0, 0.0, 1.0, model::SomeColor::ColorSpace::sRGB);
    ItemList list;
    for (const char *kind = kinds; *kind; ++kind) {
        const int number = static_cast<int>(list.size());
        list.push_back(*kind == '.'   ? ColorItem::filler(number)
                       : *kind == 's' ? ColorItem::suggestedColor(color, number)
                       : *kind == '+' ? ColorItem::addButton()
                                      : ColorItem::favoriteColor(color, number));
    }
    return list;
}

} // namespace

class PageLayoutTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void stripFits()
    {
        const auto fit = [](double width, const favorites::SwatchMetrics &metrics) {
            const auto [swatchesPerPage, inset] = favorites::stripFit(width, metrics);
            return std::pair(swatchesPerPage, inset);
        };
        QCOMPARE(fit(200.0, portrait), std::pair(8, 13.0));
        QCOMPARE(fit(200.0, landscape), std::pair(8, 20.0));
        // Just enough for one more, and just too little.
        QCOMPARE(fit(222.0, portrait), std::pair(10, 0.0));
        QCOMPARE(fit(221.0, portrait), std::pair(8, 23.5));
        // No more than sixteen, and no fewer than two.
        QCOMPARE(fit(1000.0, portrait), std::pair(16, 317.0));
        QCOMPARE(fit(50.0, portrait), std::pair(2, 10.0));
        QCOMPARE(fit(40.0, portrait), std::pair(2, 10.0));
        QCOMPARE(fit(0.0, landscape), std::pair(2, 11.0));
        QCOMPARE(fit(std::numeric_limits<double>::quiet_NaN(), portrait), std::pair(2, 10.0));
    }

    void itemsFillPagesRowByRow()
    {
        const PageLayout layout(portrait, 8);
        QCOMPARE(layout.pageSize(), QSizeF(174.0, 78.0));
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

    void everyPointFindsItsItem()
    {
        const PageLayout layout(portrait, 6);
        const int count = 100;
        for (int place = 0; place < count; ++place) {
            const QRectF frame = layout.frame(place);
            for (const QPointF inside :
                 {frame.center(), frame.topLeft() + QPointF(0.5, 0.5), frame.bottomRight() + QPointF(6.0, -2.0),
                  frame.topLeft() + QPointF(-6.0, 2.0)})
                QCOMPARE(layout.placeAt(inside, count), std::optional(place));
            QCOMPARE(layout.placeAt(frame.bottomRight() + QPointF(9.0, -2.0), count), std::nullopt);
            QCOMPARE(layout.placeAt(frame.center(), place), std::nullopt);
        }
        for (const QPointF outside : {QPointF(-9.0, 5.0), QPointF(5.0, -9.0), QPointF(1.0e300, 5.0)})
            QCOMPARE(layout.placeAt(outside, count), std::nullopt);
    }

    void pageIsNamedRightHoweverFarOut()
    {
        const int count = 10'000;
        for (const int perPage : {2, 8, 12, 16}) {
            const PageLayout layout(portrait, perPage);
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

    void dragComesToRest()
    {
        // Pages are 192 apart.
        const PageLayout layout(portrait, 8);
        const auto from2 = [&](double off, double velocity) {
            return layout.restingPage(384.0 + off, velocity, 2, 40);
        };
        QCOMPARE(from2(80.0, 10.0), 2);
        QCOMPARE(from2(120.0, 10.0), 3);
        QCOMPARE(from2(20.0, 400.0), 3);
        QCOMPARE(from2(-20.0, -400.0), 1);
        // However far or quick, by one; and where it is flung back at the end, back.
        QCOMPARE(from2(2 * 192.0, 10.0), 3);
        QCOMPARE(from2(192.0, 9000.0), 3);
        QCOMPARE(from2(60.0, -400.0), 1);
        // Not beyond the ends.
        QCOMPARE(layout.restingPage(900.0, 900.0, 4, 40), 4);
        QCOMPARE(layout.restingPage(-50.0, -900.0, 0, 40), 0);
        QCOMPARE(layout.restingPage(0.0, 900.0, 0, 0), 0);
    }

    void visiblePlaces()
    {
        const auto places = [](double offset) { return PageLayout(portrait, 8).visiblePlaces(offset, 21); };
        QCOMPARE(places(192.0), std::pair(8, 16));
        QCOMPARE(places(192.0 - 10.0), std::pair(8, 16));
        QCOMPARE(places(220.0), std::pair(8, 21));
        QCOMPARE(places(2 * 192.0), std::pair(16, 21));
        // Beyond the ends.
        QCOMPARE(places(-60.0), std::pair(0, 8));
        QCOMPARE(places(2 * 192.0 + 60.0), std::pair(16, 21));
        QCOMPARE(places(1.0e9), std::pair(16, 21));
        QCOMPARE(PageLayout(portrait, 8).visiblePlaces(192.0, 0), std::pair(0, 0));
    }

    void keysLeadTo()
    {
        // On pages of two rows of three: where a key leads, and where it does on mirrored ones.
        const auto led = [](const char *kinds, int from, Qt::Key key) {
            const auto to = [&](Qt::LayoutDirection direction) {
                return favorites::placeForKey(key, items(kinds), PageLayout(portrait, 6), from, direction).value_or(-1);
            };
            return std::pair(to(Qt::LeftToRight), to(Qt::RightToLeft));
        };
        const char *plain = "fffffffffffff+";
        QCOMPARE(led(plain, 2, Qt::Key_Right), std::pair(3, 1));
        QCOMPARE(led(plain, 2, Qt::Key_Left), std::pair(1, 3));
        QCOMPARE(led(plain, 5, Qt::Key_Right), std::pair(6, 4));
        // Not before the first, and not behind the last.
        QCOMPARE(led(plain, 0, Qt::Key_Left), std::pair(0, 1));
        QCOMPARE(led(plain, 13, Qt::Key_Right), std::pair(13, 12));
        // Down: not to the next page, and not to nothing.
        QCOMPARE(led(plain, 1, Qt::Key_Down), std::pair(4, 4));
        QCOMPARE(led(plain, 4, Qt::Key_Down), std::pair(4, 4));
        QCOMPARE(led(plain, 12, Qt::Key_Down), std::pair(12, 12));
        QCOMPARE(led(plain, 10, Qt::Key_Up), std::pair(7, 7));
        // By pages, on to the last item, and not beyond.
        QCOMPARE(led(plain, 4, Qt::Key_PageDown), std::pair(10, 10));
        QCOMPARE(led(plain, 10, Qt::Key_PageDown), std::pair(13, 13));
        QCOMPARE(led(plain, 13, Qt::Key_PageDown), std::pair(13, 13));
        QCOMPARE(led(plain, 13, Qt::Key_PageUp), std::pair(7, 7));
        QCOMPARE(led(plain, 4, Qt::Key_PageUp), std::pair(4, 4));
        QCOMPARE(led(plain, 9, Qt::Key_Home), std::pair(0, 0));
        QCOMPARE(led(plain, 9, Qt::Key_End), std::pair(13, 13));
        // Over fillers, by places and by pages.
        const char *filled = "ss....fff+";
        const char *filledPage = "ssssss......ff+";
        QCOMPARE(led(filled, 1, Qt::Key_Right), std::pair(6, 0));
        QCOMPARE(led(filled, 6, Qt::Key_Left), std::pair(1, 7));
        QCOMPARE(led(filled, 1, Qt::Key_Down), std::pair(1, 1));
        QCOMPARE(led(filledPage, 2, Qt::Key_PageDown), std::pair(12, 12));
        QCOMPARE(led(filledPage, 13, Qt::Key_PageUp), std::pair(5, 5));
        QCOMPARE(led(plain, 3, Qt::Key_A), std::pair(-1, -1));
    }

    void dotsAreShown_data()
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

    void dotsAreShown()
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
        const bool isFirstSmall = dots.front().scale < 1.0;
        QCOMPARE(isFirstSmall, first > 0 && first != current);
        QCOMPARE(dots.back().scale < 1.0, first + count < pages && dots.back().page != current);
    }

    void pointsAndDragsNamePages()
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
};

QTEST_GUILESS_MAIN(PageLayoutTest)
#include "tst_pagelayout.moc"
