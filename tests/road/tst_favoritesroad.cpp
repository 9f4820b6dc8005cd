#include "onepointer.h"
#include "roadhost.h"

#include "service/favoritesstore.h"

#include <QGuiApplication>
#include <QTemporaryDir>

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

    void click(QPoint place, Qt::MouseButton button = Qt::LeftButton) { QTest::mouseClick(&window, button, {}, place); }
    QRgb pixel(QPoint place) { return window.grabWindow().pixel(place); }
    /** The item of the menu above a favorite; off its middle, where no text is. */
    QPoint menuItem(QPoint favorite) const { return favorite - QPoint(38, 46); }
    /** The dot of a page, of three. */
    QPoint pageDot(int page) const
    {
        const QPoint first = favorite(0, 0);
        const QPoint last = favorite(1, columns - 1);
        return {(first.x() + last.x()) / 2 + 16 * (page - 1), last.y() + 14 + 8 + 13};
    }
};

FVColor gray(int number)
{
    return {number / 255.0, number / 255.0, number / 255.0};
}

QString text(double red, double green, double blue)
{
    return QColor::fromRgbF(float(red), float(green), float(blue)).name().mid(1);
}

QString text(const FVColor &color)
{
    return text(color.red(), color.green(), color.blue());
}

} // namespace

/** The favorites, from the app's window to what the picker's process stores for the next one. */
class FavoritesRoadTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanup();

    void theAddButtonKeepsTheColorForLater_data();
    void theAddButtonKeepsTheColorForLater();
    void aFavoriteThatWasSeenOutlivesAKilledProcess();
    void aFavoriteIsDeleted_data();
    void aFavoriteIsDeleted();
    void pagesAreTurned_data();
    void pagesAreTurned();

private:
    QString defaultsFile() const { return m_data.path() + QStringLiteral("/defaults.sqlite"); }
    FavoritesStore::ColorList stored() const;
    QStringList storedTexts() const;

    QTemporaryDir m_data;
    const QPointingDevice *m_touchScreen = QTest::createTouchDevice();
};

void FavoritesRoadTest::initTestCase()
{
    QVERIFY(m_data.isValid());
    qputenv("FAVRIN_DEFAULTS_FILE", QFile::encodeName(defaultsFile()));
}

void FavoritesRoadTest::cleanup()
{
    QTRY_VERIFY(servicesOf(getpid()).empty());
    // Each test begins with the favorites that a new user has.
    for (const auto &file : QDir(m_data.path()).entryInfoList(QDir::Files))
        QVERIFY(QFile::remove(file.filePath()));
}

FavoritesStore::ColorList FavoritesRoadTest::stored() const
{
    UserDefaults defaults(defaultsFile().toStdString());
    return FavoritesStore(defaults).favoriteColors(true);
}

QStringList FavoritesRoadTest::storedTexts() const
{
    QStringList texts;
    for (const SomeColor &color : stored())
        texts << text(color.r, color.g, color.b);
    return texts;
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

void FavoritesRoadTest::aFavoriteIsDeleted_data()
{
    QTest::addColumn<QString>("how");
    QTest::newRow("long press") << QStringLiteral("finger");
    QTest::newRow("other mouse button") << QStringLiteral("mouse");
    QTest::newRow("menu key") << QStringLiteral("menu");
    QTest::newRow("Delete") << QStringLiteral("delete");
}

void FavoritesRoadTest::aFavoriteIsDeleted()
{
    QFETCH(QString, how);
    const bool byKey = how != u"finger" && how != u"mouse";
    FavoritesHost host;
    host.picker.setSelectedColor(FVColor(1, 1, 1));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    const QPoint favorite = host.favorite(0, 2);
    const QPoint item = host.menuItem(favorite);
    const QRgb before = host.pixel(item);

    if (byKey)
        host.click(favorite);
    Pointer finger(host.window, m_touchScreen);
    if (how == u"finger")
        finger.press(favorite);
    else if (how == u"mouse")
        host.click(favorite, Qt::RightButton);
    else if (how == u"menu")
        QTest::keyClick(&host.window, Qt::Key_Menu);
    else
        QTest::keyClick(&host.window, Qt::Key_Delete);
    if (how != u"delete") {
        QTRY_VERIFY(host.pixel(item) != before);
        QCOMPARE(stored().size(), std::size_t(5));
    }
    if (how == u"finger")
        finger.release(favorite);
    if (how == u"menu")
        QTest::keyClick(&host.window, Qt::Key_Return);
    else if (!byKey)
        host.click(item);

    const QStringList left = {QStringLiteral("000000"), QStringLiteral("0061fd"), QStringLiteral("ffcc01"),
                              QStringLiteral("ff3a2f")};
    QTRY_COMPARE(storedTexts(), left);
    // Neither the long press nor the menu picks; the next favorite has moved up.
    const std::size_t picksBefore = byKey ? 1 : 0;
    QTRY_COMPARE(host.pixel(favorite), 0xffffcc01);
    QCOMPARE(host.picks.size(), picksBefore);
    host.click(favorite);
    QTRY_COMPARE(host.picks.size(), picksBefore + 1);
    QCOMPARE(text(host.picks.back().color), QStringLiteral("ffcc01"));
}

void FavoritesRoadTest::pagesAreTurned_data()
{
    QTest::addColumn<QString>("how");
    QTest::addColumn<Qt::LayoutDirection>("direction");
    QTest::newRow("swipe") << QStringLiteral("swipe") << Qt::LeftToRight;
    QTest::newRow("swipe, right to left") << QStringLiteral("swipe") << Qt::RightToLeft;
    QTest::newRow("page control") << QStringLiteral("dots") << Qt::LeftToRight;
    QTest::newRow("keys") << QStringLiteral("keys") << Qt::LeftToRight;
}

void FavoritesRoadTest::pagesAreTurned()
{
    QFETCH(QString, how);
    QFETCH(Qt::LayoutDirection, direction);
    constexpr int favorites = 20;
    constexpr int perPage = 2 * columns;
    FavoritesStore::ColorList colors;
    for (int i = 0; i < favorites; ++i)
        colors.emplace_back(10 * i / 255.0, 10 * i / 255.0, 10 * i / 255.0, 1.0, SomeColor::ColorSpace::sRGB);
    UserDefaults defaults(defaultsFile().toStdString());
    FavoritesStore(defaults).saveFavoriteColors(colors, true);

    FavoritesHost host;
    host.picker.setLayoutDirection(direction);
    host.picker.setSelectedColor(FVColor(1, 1, 1));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    const auto place = [&host, direction](int row, int column) {
        const QPoint leftToRight = host.favorite(row, column);
        const auto *view = host.picker.view();
        const int mirrored = qRound(2 * view->mapToScene(QPointF(view->width() / 2, 0)).x()) - leftToRight.x();
        return direction == Qt::RightToLeft ? QPoint(mirrored, leftToRight.y()) : leftToRight;
    };
    if (how == u"keys")
        host.click(place(0, 0));
    for (const int page : {1, 2, 1, 0}) {
        const bool isForward = qGray(host.pixel(place(0, 0))) < 10 * perPage * page;
        if (how == u"swipe") {
            const int from = isForward ? columns - 1 : 0;
            const int to = columns - 1 - from;
            QPoint finger = place(0, from);
            const int step = finger.x() > place(0, to).x() ? -8 : 8;
            // Until the next page's foremost swatch has come three quarters of the way.
            const int seen = isForward ? 1 : 2;
            const int wanted = 10 * (perPage * page + to);
            Pointer pointer(host.window, m_touchScreen);
            pointer.press(finger);
            QVERIFY(QTest::qWaitFor([&] {
                pointer.move(finger += QPoint(step, 0));
                return qGray(host.pixel(place(0, seen))) == wanted;
            }));
            pointer.release(finger);
        } else if (how == u"dots") {
            host.click(host.pageDot(page));
        } else {
            QTest::keyClick(&host.window, isForward ? Qt::Key_PageDown : Qt::Key_PageUp);
        }
        QTRY_COMPARE(qGray(host.pixel(place(0, 0))), 10 * perPage * page);
        if (how == u"keys")
            QTest::keyClick(&host.window, Qt::Key_Space);
        else
            host.click(place(0, 0));
        const FVColor wanted = gray(10 * perPage * page);
        QTRY_VERIFY(!host.picks.empty() && host.picks.back().color == wanted);
    }
}

int main(int argc, char *argv[])
{
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    QGuiApplication application(argc, argv);
    FavoritesRoadTest test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_favoritesroad.moc"
