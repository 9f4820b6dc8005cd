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

/** Rules and looks of the loupe, without a screen. */
class TestLoupe : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theLoupeIsSeenWhole_data()
    {
        QTest::addColumn<QPoint>("crosshair");
        QTest::addColumn<LoupePlacement>("placement");
        const QRect display(100, 50, 1000, 700);
        const QList<QPoint> places = {display.center(),     display.topLeft(),     display.topRight(),
                                      display.bottomLeft(), display.bottomRight(), QPoint(600, 50),
                                      QPoint(600, 749)};
        for (const QPoint place : places) {
            QTest::addRow("around %d,%d", place.x(), place.y()) << place << LoupePlacement::Around;
            QTest::addRow("above %d,%d", place.x(), place.y()) << place << LoupePlacement::Above;
        }
    }

    void theLoupeIsSeenWhole()
    {
        QFETCH(QPoint, crosshair);
        QFETCH(LoupePlacement, placement);
        const QRect display(100, 50, 1000, 700);
        for (const double scale : {1.0, 1.25, 2.0}) {
            const LoupeGeometry loupe =
                loupeGeometry(crosshair, display, QSize(180, 50), placement, LoupeMetrics(scale));
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

    void theCrosshairStaysOnTheDisplays()
    {
        const auto nearest = [](QPoint wanted) {
            return nearestPixel(wanted, {QRect(0, 0, 1000, 1000), QRect(1000, 0, 1000, 500)});
        };
        QCOMPARE(nearest({10, 20}), QPoint(10, 20));
        QCOMPARE(nearest({1500, 100}), QPoint(1500, 100));
        QCOMPARE(nearest({-5, 20}), QPoint(0, 20));
        QCOMPARE(nearest({400, 5000}), QPoint(400, 999));
        // Beside the lower one, and below the upper one.
        QCOMPARE(nearest({1001, 900}), QPoint(999, 900));
        QCOMPARE(nearest({1800, 520}), QPoint(1800, 499));
    }

    void fingersMoveAndTap()
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

    void pixelsAreReadExactly()
    {
        const auto read = [](QImage::Format format, quint32 bits) {
            QImage picture(3, 2, format);
            picture.fill(Qt::black);
            reinterpret_cast<quint32 *>(picture.scanLine(1))[2] = bits;
            return colorOfPixel(picture, {2, 1});
        };
        const auto color = [](double red, double green, double blue) {
            return platform::Color(platform::ColorSpace::sRGB(), std::array{red, green, blue}, 1.0);
        };
        QVERIFY(read(QImage::Format_RGB32, 0x00807f01U) == color(128 / 255.0, 127 / 255.0, 1 / 255.0));
        // Junk above the eight bits.
        QVERIFY(read(QImage::Format_RGB32, 0x12ff0001U) == color(1, 0, 1 / 255.0));
        const quint32 tenBits = 512U << 20 | 511U << 10 | 1U;
        QVERIFY(read(QImage::Format_RGB30, tenBits) == color(512 / 1023.0, 511 / 1023.0, 1 / 1023.0));
        QVERIFY(read(QImage::Format_BGR30, tenBits) == color(1 / 1023.0, 511 / 1023.0, 512 / 1023.0));
    }

    void theLensShowsThePixels_data()
    {
        QTest::addColumn<double>("scale");
        for (const double scale : {1.0, 1.5, 2.0, 4.0})
            QTest::addRow("%gx", scale) << scale;
    }

    void theLensShowsThePixels()
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
        const auto loupe = loupeGeometry(crosshair, picture.rect(), painter.labelSize(text), LoupePlacement::Around,
                                         painter.metrics());
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

    void beyondTheScreenIsNeverAColorOfIt()
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

    void theMethodFollowsTheSession()
    {
        const auto isLoupe = [](const char *wayland, const char *type, bool hasX11) {
            return pickingMethod({.waylandDisplay = QString::fromLatin1(wayland),
                                  .sessionType = QString::fromLatin1(type),
                                  .hasX11 = hasX11}) == PickingMethod::Loupe;
        };
        QVERIFY(isLoupe("", "x11", true));
        QVERIFY(isLoupe("", "", true));
        // Wayland, where X11 apps run too: by its type, by its socket, or by both.
        QVERIFY(!isLoupe("wayland-0", "wayland", true));
        QVERIFY(!isLoupe("", "wayland", true));
        QVERIFY(!isLoupe("wayland-0", "", true));
        QVERIFY(!isLoupe("", "", false));
        QVERIFY(!isLoupe("", "tty", false));
    }
};

QTEST_MAIN(TestLoupe)
#include "tst_loupe.moc"
