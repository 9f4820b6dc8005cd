#include "onepointer.h"
#include "roadtest.h"

namespace {

constexpr int spectrumTab = 1;
constexpr int slidersTab = 2;

bool isAbout(const FVColor &color, double red, double green, double blue)
{
    const auto isNear = [](double value, double wanted) { return std::abs(value - wanted) < 1e-6; };
    return isNear(color.red(), red) && isNear(color.green(), green) && isNear(color.blue(), blue);
}

/** Whether the pixels show the color, with a rounding to spare. */
bool isAbout(QRgb pixel, const QColor &color)
{
    const auto isNear = [](int a, int b) { return std::abs(a - b) <= 1; };
    return isNear(qRed(pixel), color.red()) && isNear(qGreen(pixel), color.green()) &&
           isNear(qBlue(pixel), color.blue());
}

} // namespace

/** The spectrum and the tab picker, from the app's window to the picker's process and back. */
class TabsRoadTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void aDragAcrossTheSpectrumKeepsOpacityAndSpace_data()
    {
        QTest::addColumn<QString>("space");
        QTest::addColumn<bool>("byTouch");
        QTest::newRow("sRGB, finger") << FVColor::sRGBName() << true;
        QTest::newRow("Display P3, mouse") << FVColor::displayP3Name() << false;
    }

    void aDragAcrossTheSpectrumKeepsOpacityAndSpace()
    {
        QFETCH(QString, space);
        QFETCH(bool, byTouch);
        RoadHost host;
        QVERIFY(host.present(FVColor(0.25, 0.5, 0.75, 0.4, space)));
        host.click(host.tabSegment(spectrumTab));

        Pointer pointer(host.window, byTouch ? touchScreen() : nullptr);
        pointer.press(host.inTab(0.5, 0.3));
        QTRY_VERIFY(host.picks.size() >= 2);
        pointer.move(host.inTab(0, 0.4));
        QTRY_VERIFY(isAbout(host.picks.back().color, 1, 1, 1));
        pointer.move(host.inTab(1.3, 0.9));
        QTRY_VERIFY(isAbout(host.picks.back().color, 0, 0, 0));
        pointer.release(host.inTab(1.3, 0.9));
        QTRY_VERIFY(host.hasFinalPick());

        QVERIFY(isAbout(host.picks.back().color, 0, 0, 0));
        for (std::size_t i = 0; i < host.picks.size(); ++i) {
            QCOMPARE(host.picks[i].isVolatile, i + 1 < host.picks.size());
            QCOMPARE(host.picks[i].color.alpha(), 0.4);
            QCOMPARE(host.picks[i].space, space);
        }
    }

    void theLensAndTheFieldShowWhatIsPicked_data()
    {
        QTest::addColumn<QPointF>("place");
        QTest::addColumn<QString>("space");
        QTest::newRow("tint") << QPointF(0.2, 0.15) << FVColor::sRGBName();
        QTest::newRow("full color") << QPointF(0.5, 0.6) << FVColor::sRGBName();
        QTest::newRow("shade") << QPointF(0.8, 0.35) << FVColor::displayP3Name();
    }

    void theLensAndTheFieldShowWhatIsPicked()
    {
        QFETCH(QPointF, place);
        QFETCH(QString, space);
        RoadHost host;
        // Of a width that makes the field a whole number of points high: its pixels are then those of the window.
        QQuickItem container(host.window.contentItem());
        container.setSize(QSizeF(392, 690));
        host.picker.setSelectedColor(FVColor(0.25, 0.5, 0.75, 1, space));
        QVERIFY(host.embed(container));
        host.click(host.tabSegment(spectrumTab));

        const QPoint pixel = host.inTab(place.x(), place.y());
        const auto send = [&host](QEvent::Type type, QPointF position) {
            const auto button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
            const auto held = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
            QMouseEvent event(type, position, position, button, held, {});
            QCoreApplication::sendEvent(&host.window, &event);
        };
        const auto hasRing = [&host](QPoint center) {
            const QImage picture = host.window.grabWindow();
            constexpr int radius = 13;
            const QPoint directions[] = {{1, 0}, {-1, 0}, {0, -1}, {0, 1}};
            return std::ranges::all_of(
                directions, [&](QPoint direction) { return picture.pixel(center + radius * direction) == 0xffffffff; });
        };
        // The middle of a pixel, which is what the field's pixel shows.
        send(QEvent::MouseButtonPress, QPointF(pixel) + QPointF(0.5, 0.5));
        QTRY_VERIFY(host.picks.size() >= 2);
        const QColor picked = host.picks.back().color.toQColor();
        QTRY_VERIFY(hasRing(pixel));
        QVERIFY(isAbout(host.pixel(pixel), picked));

        const QPoint elsewhere = host.inTab(0.5, 0.9);
        send(QEvent::MouseMove, elsewhere);
        QTRY_VERIFY(hasRing(elsewhere));
        const QRgb field = host.pixel(pixel);
        QVERIFY2(isAbout(field, picked), qPrintable(QColor(field).name() + QLatin1Char(' ') + picked.name()));
        send(QEvent::MouseButtonRelease, elsewhere);
        QTRY_VERIFY(host.hasFinalPick());
    }

    void theTabThatWasLeftIsShownAgain()
    {
        RoadHost host(QSize(420, 900));
        QVERIFY(host.present(FVColor(0.75, 0.5, 0.25)));
        host.click(host.tabSegment(slidersTab));
        // Beside its title the segment is white once its tab is shown.
        QTRY_COMPARE(host.pixel(host.tabSegment(slidersTab) + QPoint(50, 0)), 0xffffffff);
        host.picker.dismiss();
        QTRY_COMPARE(host.finished.size(), 1);
        QVERIFY(host.present());
        // The left end of red's track; the grid and the spectrum have no such color.
        host.click(host.inTab(0.01, 0.13));
        QTRY_VERIFY(host.hasFinalPick() && isAbout(host.picks.back().color, 0, 0.5, 0.25));
    }
};

QTEST_MAIN(TabsRoadTest)
#include "tst_tabsroad.moc"
