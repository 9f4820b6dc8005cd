#include "onepointer.h"
#include "roadtest.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMimeData>

using State = FVColorPickerViewController::State;

/** From the app to the picker's process and back, all of it real: only the display is missing. */
class PickerRoadTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void aTouchDragGivesVolatilePicksAndOneFinal()
    {
        RoadHost host;
        QVERIFY(host.present(FVColor(0.25, 0.5, 0.75, 0.5)));
        Pointer finger(host.window, touchScreen());
        finger.press(host.swatch(3, 5));
        QTRY_VERIFY(!host.picks.empty());
        for (int column = 6; column < 10; ++column) {
            finger.move(host.swatch(3, column));
            // Each step arrives: the host merges only what the service has not taken in yet.
            const auto reported = host.picks.size();
            QTRY_VERIFY(host.picks.size() > reported);
        }
        finger.release(host.swatch(4, 10));
        QTRY_VERIFY(host.hasFinalPick());

        for (std::size_t i = 0; i + 1 < host.picks.size(); ++i)
            QVERIFY2(host.picks[i].isVolatile, qPrintable(QString::number(i)));
        const FVColor last(0xC3 / 255.0, 0xD1 / 255.0, 0x17 / 255.0, 0.5);
        QCOMPARE(host.picks.back(), (RoadHost::Pick{last, FVColor::sRGBName(), false}));
        // The color before the final one is the same: lifting adds nothing.
        QCOMPARE(host.picks[host.picks.size() - 2].color, last);
        QCOMPARE(host.picker.selectedColor(), last);
    }

    void aMouseDragThatLeavesThePickerGoesOn()
    {
        RoadHost host;
        QVERIFY(host.present());
        const int outside = host.window.width() - 2;
        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(9, 11));
        QTest::mouseMove(&host.window, QPoint(outside, host.swatch(0, 0).y()));
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, QPoint(outside, 2));
        QTRY_VERIFY(host.hasFinalPick());
        QCOMPARE(host.picks.back().color, FVColor(0, 0, 0));
    }

    void theHostsColorComesBackBitForBitAndIsNotEchoed_data()
    {
        QTest::addColumn<FVColor>("color");
        QTest::newRow("sRGB, odd bits") << FVColor(0.1 + 0.2, 1.0 / 3.0, 5e-324, 0.123456789012345678);
        QTest::newRow("Display P3") << FVColor(0.9999999999999999, 0.2, 0.7, 1, FVColor::displayP3Name());
        QTest::newRow("fully transparent") << FVColor(1, 1, 1, 0);
    }

    void theHostsColorComesBackBitForBitAndIsNotEchoed()
    {
        QFETCH(FVColor, color);
        RoadHost host;
        QVERIFY(host.present());
        host.picker.setSelectedColor(FVColor(0.5, 0.5, 0.5));
        host.picker.setSelectedColor(color);
        // The first thing a press reports is that the color there is has become volatile: the host's own, untouched.
        // Had the host's colors been echoed, they would stand before it.
        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(5, 5));
        QTRY_VERIFY(host.picks.size() >= 2);
        QCOMPARE(host.picks[0], (RoadHost::Pick{color, color.colorSpace(), true}));
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, host.swatch(5, 5));
        QTRY_VERIFY(host.hasFinalPick());
        QCOMPARE(host.picks.back().color.colorSpace(), color.colorSpace());
        QCOMPARE(host.picks.back().color.alpha(), color.alpha());
    }

    void theUserEndsThePresentation_data()
    {
        QTest::addColumn<QString>("how");
        for (const char *how : {"close button", "Escape", "click beside a popover"})
            QTest::newRow(how) << QString::fromLatin1(how);
    }

    void theUserEndsThePresentation()
    {
        QFETCH(QString, how);
        RoadHost host;
        QQuickItem anchor(host.window.contentItem());
        anchor.setPosition(QPointF(20, 20));
        anchor.setSize(QSizeF(80, 30));
        if (how == u"click beside a popover")
            host.picker.presentPopover(&anchor);
        else
            host.picker.present(&host.window);
        QTRY_VERIFY(host.isReady());
        if (how == u"close button")
            host.click(host.closeButton());
        else if (how == u"Escape")
            QTest::keyClick(&host.window, Qt::Key_Escape);
        else
            host.click(QPoint(host.window.width() - 5, host.window.height() - 5));
        QTRY_COMPARE(host.finished.size(), 1);
        QCOMPARE(host.picker.state(), State::NotRunning);
        QVERIFY(!host.picker.view());
    }

    void theAppEndsThePresentation()
    {
        RoadHost host;
        host.picker.present(&host.window);
        // Even before anything is shown.
        host.picker.dismiss();
        QCOMPARE(host.picker.state(), State::Stopping);
        QTRY_COMPARE(host.finished.size(), 1);
        QVERIFY(host.present());
        // A gesture that this cuts off is made final.
        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        QTRY_VERIFY(host.picks.size() >= 2);
        host.picker.dismiss();
        QTRY_COMPARE(host.finished.size(), 2);
        QCOMPARE(host.picks.back(), (RoadHost::Pick{FVColor(1, 1, 1), FVColor::sRGBName(), false}));
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, QPoint(5, 5));
    }

    void anEmbeddedPickerFillsItsContainer()
    {
        RoadHost host;
        QQuickItem container(host.window.contentItem());
        container.setPosition(QPointF(30, 40));
        container.setSize(QSizeF(360, 500));
        QVERIFY(host.embed(container));
        QCOMPARE(host.picker.view()->size(), container.size());
        QVERIFY(!host.picker.wantsMaterial());
        host.click(host.swatch(0, 11));
        QTRY_VERIFY(host.hasFinalPick());
        QCOMPARE(host.picks.back().color, FVColor(0, 0, 0));
        container.setSize(QSizeF(420, 500));
        host.click(host.swatch(0, 0));
        QTRY_COMPARE(host.picks.back().color, FVColor(1, 1, 1));
    }

    void nothingIsDrawnWhileTheAppHidesThePicker()
    {
        RoadHost host;
        QQuickItem container(host.window.contentItem());
        container.setSize(QSizeF(360, 560));
        QVERIFY(host.embed(container));
        // The well fills a place with the color.
        const auto shows = [&host](QRgb color) {
            const QImage picture = host.window.grabWindow().convertToFormat(QImage::Format_RGB32);
            const auto *pixels = reinterpret_cast<const QRgb *>(picture.constBits());
            return std::count(pixels, pixels + picture.sizeInBytes() / 4, color) > 1000;
        };
        host.picker.setSelectedColor(FVColor(0, 0, 1));
        QTRY_VERIFY(shows(qRgb(0, 0, 255)));

        container.setVisible(false);
        QSignalSpy frames(&host.window, &QQuickWindow::frameSwapped);
        constexpr int changes = 12;
        for (int i = 1; i <= changes; ++i) {
            host.picker.setSelectedColor(FVColor(1, 1 - double(i) / changes, 0));
            frames.wait(40);
        }
        // The window's without it, and one that was on its way.
        QVERIFY2(frames.count() <= 3, qPrintable(QString::number(frames.count())));
        container.setVisible(true);
        QTRY_VERIFY(shows(qRgb(255, 0, 0)));
    }

    void aServiceThatCannotRunIsReported_data()
    {
        QTest::addColumn<QByteArray>("program");
        QTest::newRow("missing") << QByteArray("/nonexistent/service");
        QTest::newRow("ends at once") << QByteArray("/bin/true");
        QTest::newRow("no program") << QByteArray("/etc/passwd");
    }

    void aServiceThatCannotRunIsReported()
    {
        QFETCH(QByteArray, program);
        qputenv("FAVRIN_COLOR_PICKER_SERVICE", program);
        RoadHost host;
        host.picker.present(&host.window);
        QTRY_COMPARE(host.terminated.size(), 1);
        QCOMPARE(host.picker.state(), State::Failed);
    }

    void aServiceStartedAheadIsTheOneThatIsShown()
    {
        FVColorPickerViewController::startServiceAhead();
        FVColorPickerViewController::startServiceAhead();
        QTRY_COMPARE(servicesOf(getpid()).size(), std::size_t(1));
        const auto ahead = servicesOf(getpid());
        RoadHost host;
        QVERIFY(host.present(FVColor(1, 1, 1)));
        QCOMPARE(servicesOf(getpid()), ahead);
        // What it said while nobody listened counts all the same.
        QVERIFY(host.picker.wantsMaterial());
        QCOMPARE(host.picker.preferredContentSize().width(), 568.0);
        host.click(host.swatch(0, 11));
        QTRY_VERIFY(host.hasFinalPick());
        QCOMPARE(host.picks.back().color, FVColor(0, 0, 0));
    }

    void aWideDisplayIsDrawnAndPickedInDisplayP3()
    {
        RoadHost host;
        host.picker.setDisplayGamut(FVColorPickerViewController::DisplayGamut::P3);
        host.picker.setReduceMotion(true);
        QVERIFY(host.present());
        // sRGB B51A00, in Display P3.
        const QPoint swatch = host.swatch(3, 5);
        host.click(swatch);
        QTRY_VERIFY(host.hasFinalPick());
        const FVColor picked = host.picks.back().color;
        QCOMPARE(host.picks.back().space, FVColor::displayP3Name());
        QVERIFY(std::abs(picked.red() - 0.6521) < 0.001 && std::abs(picked.green() - 0.1721) < 0.001);
        QCOMPARE(picked.toQColor(), QColor(0xB5, 0x1A, 0x00));
        // The pixels hold the same numbers: the host said that it shows them as Display P3.
        const QColor expected = QColor::fromRgbF(float(picked.red()), float(picked.green()), float(picked.blue()));
        QTRY_COMPARE(host.pixel(swatch), expected.rgb());
    }

    void theWindowMayGoWhileThePickerIsShown()
    {
        FVColorPickerViewController picker;
        QSignalSpy finished(&picker, &FVColorPickerViewController::colorPickerDidFinish);
        auto window = std::make_unique<QQuickWindow>();
        window->resize(600, 600);
        window->show();
        picker.present(window.get());
        QTRY_COMPARE(picker.state(), State::Ready);
        window.reset();
        QTRY_COMPARE(finished.size(), 1);
        QCOMPARE(picker.state(), State::NotRunning);
    }

    void whatIsCopiedReachesOtherApps_data()
    {
        QTest::addColumn<FVColor>("color");
        QTest::addColumn<QString>("text");
        QTest::addColumn<QColor>("desktopColor");
        QTest::newRow("sRGB") << FVColor(0, 97 / 255.0, 253 / 255.0) << "#0061FD" << QColor(0, 97, 253);
        QTest::newRow("translucent") << FVColor(1, 0, 0, 0.2) << "#FF000033" << QColor(255, 0, 0, 51);
        QTest::newRow("Display P3") << FVColor(1, 0.5, 0.25, 1, FVColor::displayP3Name())
                                    << "color(display-p3 1 0.5 0.25)" << QColor(255, 118, 38);
    }

    void whatIsCopiedReachesOtherApps()
    {
        QFETCH(FVColor, color);
        QFETCH(QString, text);
        QFETCH(QColor, desktopColor);
        QGuiApplication::clipboard()->clear();
        RoadHost host(QSize(420, 800));
        host.window.requestActivate();
        QVERIFY(host.present(color));
        // Backward from the start lies the strip of the favorites, and before it the well.
        QTest::keyClick(&host.window, Qt::Key_Backtab, Qt::ShiftModifier);
        QTest::keyClick(&host.window, Qt::Key_Backtab, Qt::ShiftModifier);
        QTest::keyClick(&host.window, Qt::Key_C, Qt::ControlModifier);
        QTRY_COMPARE(QGuiApplication::clipboard()->text(), text);
        const auto copied = QGuiApplication::clipboard()->mimeData()->colorData().value<QColor>();
        QCOMPARE(copied.rgba(), desktopColor.rgba());
    }
};

void say(const QString &line)
{
    std::puts(qPrintable(line));
    std::fflush(stdout);
}

/** A host in a process of its own, to be killed or watched: presents a picker and says what it hears. */
int runAsHost(int argc, char *argv[])
{
    QGuiApplication application(argc, argv);
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    RoadHost host;
    auto &picker = host.picker;
    QObject::connect(&picker, &FVColorPickerViewController::stateChanged, &host.window, [&host] {
        if (host.isReady())
            say(QStringLiteral("ready"));
    });
    QObject::connect(&picker, &FVColorPickerViewController::pickerDidSelectColor, &host.window, [&host] {
        const auto &[color, space, isVolatile] = host.picks.back();
        const QList<double> numbers = {color.red(), color.green(), color.blue(), color.alpha()};
        QStringList words = {QStringLiteral("pick")};
        for (const double number : numbers)
            words << QString::number(number);
        say((words << space << (isVolatile ? QStringLiteral("volatile") : QStringLiteral("final"))).join(u' '));
    });
    QObject::connect(&picker, &FVColorPickerViewController::colorPickerDidFinish, &host.window,
                     [] { say(QStringLiteral("finished")); });
    picker.setSelectedColor(FVColor(1, 1, 1));
    picker.present(&host.window);
    return QGuiApplication::exec();
}

int main(int argc, char *argv[])
{
    if (argc > 1 && qstrcmp(argv[1], "--host") == 0)
        return runAsHost(argc, argv);
    QGuiApplication application(argc, argv);
    PickerRoadTest test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_road.moc"
