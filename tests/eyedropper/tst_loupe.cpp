#include "apps/eyedropper/picker/loupegeometry.h"
#include "apps/eyedropper/picker/loupegesture.h"
#include "apps/eyedropper/picker/loupepainter.h"
#include "apps/eyedropper/picker/pickingmethod.h"
#include "apps/eyedropper/picker/screenpicture.h"

#include <QPainter>
#include <QTest>

using namespace favrin;
using namespace favrin::eyedropper;

Q_DECLARE_METATYPE(favrin::eyedropper::LoupePlacement)
Q_DECLARE_METATYPE(favrin::eyedropper::PickingMethod)

/** Rules and looks of the loupe, without a screen. */
class TestLoupe : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theLoupeIsSeenWhole_data();
    void theLoupeIsSeenWhole();
    void theCrosshairStaysOnTheDisplays_data();
    void theCrosshairStaysOnTheDisplays();
    void fingersMoveAndTap();
    void pixelsAreReadExactly_data();
    void pixelsAreReadExactly();
    void theLensShowsThePixels_data();
    void theLensShowsThePixels();
    void beyondTheScreenIsNeverAColorOfIt();
    void theMethodFollowsTheSession_data();
    void theMethodFollowsTheSession();
};

void TestLoupe::theLoupeIsSeenWhole_data()
{
    QTest::addColumn<QPoint>("crosshair");
    QTest::addColumn<LoupePlacement>("placement");
    const QRect display(100, 50, 1000, 700);
    const QList<QPoint> places = {display.center(),      display.topLeft(), display.topRight(), display.bottomLeft(),
                                  display.bottomRight(), QPoint(600, 50),   QPoint(600, 749)};
    for (const QPoint place : places) {
        QTest::addRow("around %d,%d", place.x(), place.y()) << place << LoupePlacement::Around;
        QTest::addRow("above %d,%d", place.x(), place.y()) << place << LoupePlacement::Above;
    }
}

void TestLoupe::theLoupeIsSeenWhole()
{
    QFETCH(QPoint, crosshair);
    QFETCH(LoupePlacement, placement);
    const QRect display(100, 50, 1000, 700);
    for (const double scale : {1.0, 1.25, 2.0}) {
        const LoupeGeometry loupe = loupeGeometry(crosshair, display, QSize(180, 50), placement, LoupeMetrics(scale));
        QVERIFY(display.contains(loupe.label));
        QVERIFY(loupe.bounds.contains(loupe.disc) && loupe.bounds.contains(loupe.label));
        QVERIFY(loupe.bounds.contains(crosshair));
        if (placement == LoupePlacement::Above) {
            QVERIFY(display.contains(loupe.disc));
            QVERIFY(!loupe.disc.contains(crosshair));
            QVERIFY(!loupe.disc.intersects(loupe.label));
        }
    }
}

void TestLoupe::theCrosshairStaysOnTheDisplays_data()
{
    QTest::addColumn<QPoint>("wanted");
    QTest::addColumn<QPoint>("nearest");
    QTest::newRow("on the first") << QPoint(10, 20) << QPoint(10, 20);
    QTest::newRow("on the second") << QPoint(1500, 100) << QPoint(1500, 100);
    QTest::newRow("left of all") << QPoint(-5, 20) << QPoint(0, 20);
    QTest::newRow("below all") << QPoint(400, 5000) << QPoint(400, 999);
    QTest::newRow("beside the lower one") << QPoint(1001, 900) << QPoint(999, 900);
    QTest::newRow("below the upper one") << QPoint(1800, 520) << QPoint(1800, 499);
}

void TestLoupe::theCrosshairStaysOnTheDisplays()
{
    QFETCH(QPoint, wanted);
    QFETCH(QPoint, nearest);
    QCOMPARE(nearestPixel(wanted, {QRect(0, 0, 1000, 1000), QRect(1000, 0, 1000, 500)}), nearest);
}

void TestLoupe::fingersMoveAndTap()
{
    LoupeGesture gesture(10);
    QVERIFY(!gesture.release());

    // A tap picks where it lands, however the finger trembles.
    QCOMPARE(gesture.press({50, 60}, {10, 10}, false), QPoint(50, 60));
    QCOMPARE(gesture.move({55, 64}), QPoint(50, 60));
    QVERIFY(gesture.release());

    // A drag leaves the loupe where it ends.
    gesture.press({50, 60}, {10, 10}, false);
    QCOMPARE(gesture.move({80, 60}), QPoint(80, 60));
    QCOMPARE(gesture.move({50, 60}), QPoint(50, 60));
    QVERIFY(!gesture.release());

    // On the loupe a tap confirms, and a drag moves the crosshair beside the finger.
    QCOMPARE(gesture.press({50, 60}, {50, 160}, true), QPoint(50, 160));
    QVERIFY(gesture.release());
    gesture.press({50, 60}, {50, 160}, true);
    QCOMPARE(gesture.move({90, 61}), QPoint(90, 161));
    QVERIFY(!gesture.release());

    gesture.press({50, 60}, {10, 10}, false);
    gesture.cancel();
    QVERIFY(!gesture.release());
}

void TestLoupe::pixelsAreReadExactly_data()
{
    QTest::addColumn<QImage::Format>("format");
    QTest::addColumn<quint32>("bits");
    QTest::addColumn<QList<double>>("expected");
    using List = QList<double>;
    QTest::newRow("8 bits") << QImage::Format_RGB32 << 0x00807f01U << List{128 / 255.0, 127 / 255.0, 1 / 255.0};
    QTest::newRow("8 bits, junk above") << QImage::Format_RGB32 << 0x12ff0001U << List{1, 0, 1 / 255.0};
    QTest::newRow("10 bits") << QImage::Format_RGB30 << (512U << 20 | 511U << 10 | 1U)
                             << List{512 / 1023.0, 511 / 1023.0, 1 / 1023.0};
    QTest::newRow("10 bits, blue first") << QImage::Format_BGR30 << (512U << 20 | 511U << 10 | 1U)
                                         << List{1 / 1023.0, 511 / 1023.0, 512 / 1023.0};
}

void TestLoupe::pixelsAreReadExactly()
{
    QFETCH(QImage::Format, format);
    QFETCH(quint32, bits);
    QFETCH(QList<double>, expected);
    QImage picture(3, 2, format);
    picture.fill(Qt::black);
    reinterpret_cast<quint32 *>(picture.scanLine(1))[2] = bits;
    const platform::Color color = colorOfPixel(picture, {2, 1});
    QCOMPARE(QList<double>(color.components().begin(), color.components().end()), expected);
    QVERIFY(color.colorSpace() == platform::ColorSpace::sRGB());
    QCOMPARE(color.alpha(), 1.0);
}

void TestLoupe::theLensShowsThePixels_data()
{
    QTest::addColumn<double>("scale");
    for (const double scale : {1.0, 1.5, 2.0, 4.0})
        QTest::addRow("%gx", scale) << scale;
}

void TestLoupe::theLensShowsThePixels()
{
    QFETCH(double, scale);
    // Every pixel another color, so that a lens that is off by one shows it.
    QImage picture(1200, 1200, QImage::Format_RGB32);
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x)
            picture.setPixel(x, y, qRgb(x % 251, y % 241, (x * 7 + y * 13) % 239));
    }
    const LoupePainter painter(scale);
    const QPoint crosshair(600, 500);
    const auto text = LoupeText::of(colorOfPixel(picture, crosshair));
    const auto loupe =
        loupeGeometry(crosshair, picture.rect(), painter.labelSize(text), LoupePlacement::Around, painter.metrics());
    QImage shown = picture;
    QPainter onto(&shown);
    painter.paint(onto, loupe, picture, crosshair, text);
    onto.end();

    const int cell = painter.metrics().cell;
    constexpr int half = LoupeMetrics::cellsAcross / 2;
    int seen = 0;
    for (int y = -half; y <= half; ++y) {
        for (int x = -half; x <= half; ++x) {
            // The crosshair's frame lies on the neighbors of the middle, the round edge on the corners.
            if ((std::max(std::abs(x), std::abs(y)) == 1) || std::hypot(x, y) > half - 1)
                continue;
            const QPoint center = loupe.lens.topLeft() + QPoint(x + half, y + half) * cell + QPoint(cell, cell) / 2;
            QCOMPARE(shown.pixel(center), picture.pixel(crosshair + QPoint(x, y)));
            ++seen;
        }
    }
    QVERIFY(seen > 80);
    // Around the pixel: the pointer's place lies in its magnified picture.
    const QRect middle(loupe.lens.topLeft() + QPoint(half, half) * cell, QSize(cell, cell));
    QVERIFY(middle.contains(crosshair));
}

void TestLoupe::beyondTheScreenIsNeverAColorOfIt()
{
    QImage picture(400, 400, QImage::Format_RGB32);
    picture.fill(Qt::white);
    const LoupePainter painter(1);
    const auto text = LoupeText::of(colorOfPixel(picture, {0, 200}));
    QCOMPARE(text.hex, QStringLiteral("#FFFFFF"));
    QVERIFY(!text.name.isEmpty());
    const auto loupe =
        loupeGeometry({0, 200}, picture.rect(), painter.labelSize(text), LoupePlacement::Above, painter.metrics());
    QImage shown = picture;
    QPainter onto(&shown);
    painter.paint(onto, loupe, picture, {0, 200}, text);
    onto.end();
    const QPoint leftInLens(loupe.lens.left() + painter.metrics().cell, loupe.lens.center().y());
    QVERIFY(shown.pixel(leftInLens) != picture.pixel(0, 0));
}

void TestLoupe::theMethodFollowsTheSession_data()
{
    QTest::addColumn<QString>("wayland");
    QTest::addColumn<QString>("type");
    QTest::addColumn<bool>("x11");
    QTest::addColumn<PickingMethod>("method");
    const QString none;
    const QString socket = QStringLiteral("wayland-0");
    QTest::newRow("X11") << none << QStringLiteral("x11") << true << PickingMethod::Loupe;
    QTest::newRow("X11, unsaid") << none << none << true << PickingMethod::Loupe;
    QTest::newRow("Wayland with X11 apps") << socket << QStringLiteral("wayland") << true << PickingMethod::Portal;
    QTest::newRow("Wayland by its type only") << none << QStringLiteral("wayland") << true << PickingMethod::Portal;
    QTest::newRow("Wayland by its socket only") << socket << none << true << PickingMethod::Portal;
    QTest::newRow("no display known") << none << none << false << PickingMethod::Portal;
    QTest::newRow("console") << none << QStringLiteral("tty") << false << PickingMethod::Portal;
}

void TestLoupe::theMethodFollowsTheSession()
{
    QFETCH(QString, wayland);
    QFETCH(QString, type);
    QFETCH(bool, x11);
    QFETCH(PickingMethod, method);
    QVERIFY(pickingMethod({.waylandDisplay = wayland, .sessionType = type, .hasX11 = x11}) == method);
}

QTEST_MAIN(TestLoupe)
#include "tst_loupe.moc"
