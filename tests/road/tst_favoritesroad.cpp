#include "onepointer.h"
#include "roadtest.h"

#include "service/favoritesstore.h"

using favrin::model::SomeColor;
using favrin::platform::UserDefaults;
using favrin::service::FavoritesStore;

namespace {

FVColor gray(int number)
{
    return {number / 255.0, number / 255.0, number / 255.0};
}

/** A host whose picker shows the favorites right below the tabs, and moves nothing slowly. */
class FavoritesHost : public RoadHost
{
public:
    explicit FavoritesHost(QSize size = QSize(900, 700)) : RoadHost(size)
    {
        picker.setShowsAlpha(false);
        picker.setReduceMotion(true);
    }

    /** Whether a click there is one pick of this color. */
    bool picksAt(QPoint place, const FVColor &color)
    {
        picks.clear();
        click(place);
        return QTest::qWaitFor([&] { return hasFinalPick(); }) && picks.size() == 1 && picks[0].color == color;
    }
};

} // namespace

/** The favorites, from the app's window to what the picker's process stores for the next one. */
class FavoritesRoadTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void theAddButtonKeepsTheColorForLater_data()
    {
        QTest::addColumn<QSize>("window");
        QTest::addColumn<FVColor>("color");
        QTest::addColumn<QPoint>("place");
        // Behind the five that a new user has: in the second column of the second row, or at the end of a longer row.
        QTest::newRow("wide") << QSize(900, 700) << FVColor(0.1 + 0.2, 1.0 / 3.0, 5e-324) << QPoint(1, 1);
        QTest::newRow("narrow") << QSize(420, 900) << FVColor(0.9999999999999999, 0.2, 0.7, 1, FVColor::displayP3Name())
                                << QPoint(5, 0);
    }

    void theAddButtonKeepsTheColorForLater()
    {
        QFETCH(QSize, window);
        QFETCH(FVColor, color);
        QFETCH(QPoint, place);
        {
            FavoritesHost host(window);
            QVERIFY(host.present(color));
            host.click(host.favorite(place.y(), place.x()));
            QTRY_COMPARE(stored().size(), std::size_t(6));
            // It was the selected color already.
            QVERIFY(host.picks.empty());
        }
        FavoritesHost host(window);
        QVERIFY(host.present(FVColor(1, 1, 1)));
        QVERIFY(host.picksAt(host.favorite(place.y(), place.x()), color));
    }

    void aFavoriteThatWasSeenOutlivesAKilledProcess()
    {
        FavoritesHost host;
        QVERIFY(host.present(gray(77)));
        const QPoint place = host.favorite(1, 1);
        host.click(place);
        QTRY_COMPARE(QColor(host.pixel(place)), gray(77).toQColor());
        for (const pid_t service : servicesOf(getpid()))
            kill(service, SIGKILL);
        QTRY_COMPARE(host.terminated.size(), 1);
        QVERIFY(host.present(FVColor(1, 1, 1)));
        QVERIFY(host.picksAt(host.favorite(1, 1), gray(77)));
    }

    void aLongPressDeletesAFavorite()
    {
        FavoritesHost host;
        QVERIFY(host.present(FVColor(1, 1, 1)));
        const QPoint favorite = host.favorite(0, 2);
        // The item of the menu above it; off its middle, where no text is.
        const QPoint item = favorite - QPoint(38, 46);
        const QRgb before = host.pixel(item);
        Pointer finger(host.window, touchScreen());
        finger.press(favorite);
        QTRY_VERIFY(host.pixel(item) != before);
        finger.release(favorite);
        QCOMPARE(stored().size(), std::size_t(5));
        host.click(item);
        QTRY_COMPARE(stored().size(), std::size_t(4));
        // Neither the long press nor the menu picks; the next favorite has moved up.
        QTRY_COMPARE(host.pixel(favorite), 0xffffcc01);
        QVERIFY(host.picks.empty());
        host.click(favorite);
        QTRY_COMPARE(host.picks.size(), std::size_t(1));
        QCOMPARE(host.picks[0].color.toQColor(), QColor(0xff, 0xcc, 0x01));
    }

    void aSwipeTurnsThePages()
    {
        constexpr int favorites = 20;
        constexpr int columns = 4;
        constexpr int perPage = 2 * columns;
        FavoritesStore::ColorList colors;
        for (int i = 0; i < favorites; ++i)
            colors.emplace_back(10 * i / 255.0, 10 * i / 255.0, 10 * i / 255.0, 1.0, SomeColor::ColorSpace::sRGB);
        UserDefaults defaults(defaultsFile().toStdString());
        FavoritesStore(defaults).saveFavoriteColors(colors, true);

        FavoritesHost host;
        QVERIFY(host.present(FVColor(1, 1, 1)));
        for (const int page : {1, 2, 1, 0}) {
            const bool isForward = qGray(host.pixel(host.favorite(0, 0))) < 10 * perPage * page;
            const int to = isForward ? 0 : columns - 1;
            QPoint finger = host.favorite(0, columns - 1 - to);
            // Until the next page's foremost swatch has come three quarters of the way.
            const QPoint seen = host.favorite(0, isForward ? 1 : 2);
            Pointer pointer(host.window, touchScreen());
            pointer.press(finger);
            QVERIFY(QTest::qWaitFor([&] {
                pointer.move(finger += QPoint(isForward ? -8 : 8, 0));
                return qGray(host.pixel(seen)) == 10 * (perPage * page + to);
            }));
            pointer.release(finger);
            QTRY_COMPARE(qGray(host.pixel(host.favorite(0, 0))), 10 * perPage * page);
            host.click(host.favorite(0, 0));
            QTRY_VERIFY(!host.picks.empty() && host.picks.back().color == gray(10 * perPage * page));
        }
    }

private:
    FavoritesStore::ColorList stored() const
    {
        UserDefaults defaults(defaultsFile().toStdString());
        return FavoritesStore(defaults).favoriteColors(true);
    }
};

QTEST_MAIN(FavoritesRoadTest)
#include "tst_favoritesroad.moc"
