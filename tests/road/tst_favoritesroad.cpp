#include "onepointer.h"
#include "roadtest.h"

#include "service/favoritesstore.h"

using favrin::model::SomeColor;
using favrin::platform::UserDefaults;
using favrin::service::FavoritesStore;

namespace {

constexpr QSize wideWindow(900, 700);
constexpr QSize narrowWindow(420, 900);
/** Of the strip in a wide window. */
constexpr int columns = 4;

/** A host whose picker shows the favorites right below the tabs, and moves nothing slowly. */
class FavoritesHost : public RoadHost
{
public:
    explicit FavoritesHost(QSize size = wideWindow) : RoadHost(size)
    {
        picker.setShowsAlpha(false);
        picker.setReduceMotion(true);
    }

    void click(QPoint place) { QTest::mouseClick(&window, Qt::LeftButton, {}, place); }
    QRgb pixel(QPoint place) { return window.grabWindow().pixel(place); }
    /** The item of the menu above a favorite; off its middle, where no text is. */
    QPoint menuItem(QPoint favorite) const { return favorite - QPoint(38, 46); }
};

FVColor gray(int number)
{
    return {number / 255.0, number / 255.0, number / 255.0};
}

} // namespace

/** The favorites, from the app's window to what the picker's process stores for the next one. */
class FavoritesRoadTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void theAddButtonKeepsTheColorForLater_data();
    void theAddButtonKeepsTheColorForLater();
    void aFavoriteThatWasSeenOutlivesAKilledProcess();
    void aLongPressDeletesAFavorite();
    void aSwipeTurnsThePages();

private:
    FavoritesStore::ColorList stored() const;
};

FavoritesStore::ColorList FavoritesRoadTest::stored() const
{
    UserDefaults defaults(defaultsFile().toStdString());
    return FavoritesStore(defaults).favoriteColors(true);
}

void FavoritesRoadTest::theAddButtonKeepsTheColorForLater_data()
{
    QTest::addColumn<QSize>("window");
    QTest::addColumn<FVColor>("color");
    QTest::addColumn<QPoint>("place");
    // Behind the five that a new user has: in the second column of the second row, or at the end of a longer row.
    QTest::newRow("wide") << wideWindow << FVColor(0.1 + 0.2, 1.0 / 3.0, 5e-324) << QPoint(1, 1);
    QTest::newRow("narrow") << narrowWindow << FVColor(0.9999999999999999, 0.2, 0.7, 1, FVColor::displayP3Name())
                            << QPoint(5, 0);
}

void FavoritesRoadTest::theAddButtonKeepsTheColorForLater()
{
    QFETCH(QSize, window);
    QFETCH(FVColor, color);
    QFETCH(QPoint, place);
    {
        FavoritesHost host(window);
        host.picker.setSelectedColor(color);
        host.picker.present(&host.window);
        QTRY_VERIFY(host.isReady());
        host.click(host.favorite(place.y(), place.x()));
        QTRY_COMPARE(stored().size(), std::size_t(6));
        // It was the selected color already.
        QVERIFY(host.picks.empty());
    }
    FavoritesHost host(window);
    host.picker.setSelectedColor(FVColor(1, 1, 1));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    host.click(host.favorite(place.y(), place.x()));
    QTRY_COMPARE(host.picks.size(), std::size_t(1));
    QCOMPARE(host.picks[0].color, color);
    QVERIFY(!host.picks[0].isVolatile);
}

void FavoritesRoadTest::aFavoriteThatWasSeenOutlivesAKilledProcess()
{
    FavoritesHost host;
    QSignalSpy terminated(&host.picker, &FVColorPickerViewController::colorPickerViewServiceDidTerminateWithError);
    host.picker.setSelectedColor(gray(77));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    const QPoint place = host.favorite(1, 1);
    host.click(place);
    QTRY_COMPARE(QColor(host.pixel(place)), gray(77).toQColor());
    for (const pid_t service : servicesOf(getpid()))
        kill(service, SIGKILL);
    QTRY_COMPARE(terminated.size(), 1);

    host.picker.setSelectedColor(FVColor(1, 1, 1));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    host.click(host.favorite(1, 1));
    QTRY_COMPARE(host.picks.size(), std::size_t(1));
    QCOMPARE(host.picks[0].color, gray(77));
}

void FavoritesRoadTest::aLongPressDeletesAFavorite()
{
    FavoritesHost host;
    host.picker.setSelectedColor(FVColor(1, 1, 1));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    const QPoint favorite = host.favorite(0, 2);
    const QPoint item = host.menuItem(favorite);
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

void FavoritesRoadTest::aSwipeTurnsThePages()
{
    constexpr int favorites = 20;
    constexpr int perPage = 2 * columns;
    FavoritesStore::ColorList colors;
    for (int i = 0; i < favorites; ++i)
        colors.emplace_back(10 * i / 255.0, 10 * i / 255.0, 10 * i / 255.0, 1.0, SomeColor::ColorSpace::sRGB);
    UserDefaults defaults(defaultsFile().toStdString());
    FavoritesStore(defaults).saveFavoriteColors(colors, true);

    FavoritesHost host;
    host.picker.setSelectedColor(FVColor(1, 1, 1));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
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

QTEST_MAIN(FavoritesRoadTest)
#include "tst_favoritesroad.moc"
