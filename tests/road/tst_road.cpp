#include "roadtest.h"

#include <QGuiApplication>
#include <QProcess>

using State = FVColorPickerViewController::State;

/** From the app to the picker's process and back, all of it real: only the display is missing. */
class PickerRoadTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void aTouchDragGivesVolatilePicksAndOneFinal();
    void aMouseDragThatLeavesThePickerGoesOn();
    void theHostsColorComesBackBitForBitAndIsNotEchoed_data();
    void theHostsColorComesBackBitForBitAndIsNotEchoed();
    void theUserEndsThePresentation_data();
    void theUserEndsThePresentation();
    void theAppEndsThePresentation();
    void aGestureThatTheEndCutsOffIsMadeFinal();
    void anEmbeddedPickerFillsItsContainer();
    void nothingIsDrawnWhileTheAppHidesThePicker();
    void aServiceThatCannotRunIsReported_data();
    void aServiceThatCannotRunIsReported();
    void aServiceStartedAheadIsTheOneThatIsShown();
    void aWideDisplayIsDrawnAndPickedInDisplayP3();
    void theWindowMayGoWhileThePickerIsShown();
};

void PickerRoadTest::aTouchDragGivesVolatilePicksAndOneFinal()
{
    RoadHost host;
    host.picker.setSelectedColor(FVColor(0.25, 0.5, 0.75, 0.5));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());

    auto touch = QTest::touchEvent(&host.window, const_cast<QPointingDevice *>(touchScreen()), false);
    touch.press(0, host.swatch(3, 5)).commit();
    QTRY_VERIFY(!host.picks.empty());
    for (int column = 6; column < 10; ++column) {
        touch.move(0, host.swatch(3, column)).commit();
        // Each step arrives: the host merges only what the service has not taken in yet.
        const auto wanted = host.picks.size();
        QTRY_VERIFY(host.picks.size() > wanted);
    }
    touch.release(0, host.swatch(4, 10)).commit();
    QTRY_VERIFY(!host.picks.back().isVolatile);

    for (std::size_t i = 0; i + 1 < host.picks.size(); ++i)
        QVERIFY2(host.picks[i].isVolatile, qPrintable(QString::number(i)));
    const auto &last = host.picks.back();
    QCOMPARE(last.color, FVColor(0xC3 / 255.0, 0xD1 / 255.0, 0x17 / 255.0, 0.5));
    QCOMPARE(last.space, FVColor::sRGBName());
    // The color before the final one is the same: lifting adds nothing.
    QCOMPARE(host.picks[host.picks.size() - 2].color, last.color);
    QCOMPARE(host.picker.selectedColor(), last.color);
}

void PickerRoadTest::aMouseDragThatLeavesThePickerGoesOn()
{
    RoadHost host;
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(9, 11));
    QTest::mouseMove(&host.window, QPoint(host.window.width() - 2, host.swatch(0, 0).y()));
    QTest::mouseRelease(&host.window, Qt::LeftButton, {}, QPoint(host.window.width() - 2, 2));
    QTRY_VERIFY(!host.picks.empty() && !host.picks.back().isVolatile);
    QCOMPARE(host.picks.back().color, FVColor(0, 0, 0));
}

void PickerRoadTest::theHostsColorComesBackBitForBitAndIsNotEchoed_data()
{
    QTest::addColumn<FVColor>("color");
    QTest::newRow("sRGB, odd bits") << FVColor(0.1 + 0.2, 1.0 / 3.0, 5e-324, 0.123456789012345678);
    QTest::newRow("Display P3") << FVColor(0.9999999999999999, 0.2, 0.7, 1, FVColor::displayP3Name());
    QTest::newRow("fully transparent") << FVColor(1, 1, 1, 0);
}

void PickerRoadTest::theHostsColorComesBackBitForBitAndIsNotEchoed()
{
    QFETCH(FVColor, color);
    RoadHost host;
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    host.picker.setSelectedColor(FVColor(0.5, 0.5, 0.5));
    host.picker.setSelectedColor(color);

    // The first thing a press reports is that the color there is has become volatile: the host's own, untouched. Had
    // the host's colors been echoed, they would stand before it.
    QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(5, 5));
    QTRY_VERIFY(host.picks.size() >= 2);
    QCOMPARE(host.picks[0].color, color);
    QVERIFY(host.picks[0].isVolatile);
    QCOMPARE(host.picks[0].space, color.colorSpace());
    QTest::mouseRelease(&host.window, Qt::LeftButton, {}, host.swatch(5, 5));
    QTRY_VERIFY(!host.picks.back().isVolatile);
    QCOMPARE(host.picks.back().color.colorSpace(), color.colorSpace());
    QCOMPARE(host.picks.back().color.alpha(), color.alpha());
}

void PickerRoadTest::theUserEndsThePresentation_data()
{
    QTest::addColumn<QString>("how");
    QTest::newRow("close button") << QStringLiteral("close");
    QTest::newRow("Escape") << QStringLiteral("escape");
    QTest::newRow("click beside a popover") << QStringLiteral("popover");
}

void PickerRoadTest::theUserEndsThePresentation()
{
    QFETCH(QString, how);
    RoadHost host;
    QQuickItem anchor(host.window.contentItem());
    anchor.setPosition(QPointF(20, 20));
    anchor.setSize(QSizeF(80, 30));
    QSignalSpy finished(&host.picker, &FVColorPickerViewController::colorPickerDidFinish);
    if (how == u"popover")
        host.picker.presentPopover(&anchor);
    else
        host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    if (how == u"close")
        QTest::mouseClick(&host.window, Qt::LeftButton, {}, host.closeButton());
    else if (how == u"escape")
        QTest::keyClick(&host.window, Qt::Key_Escape);
    else
        QTest::mouseClick(&host.window, Qt::LeftButton, {}, QPoint(host.window.width() - 5, host.window.height() - 5));
    QTRY_COMPARE(finished.size(), 1);
    QCOMPARE(host.picker.state(), State::NotRunning);
    QVERIFY(!host.picker.view());
}

void PickerRoadTest::theAppEndsThePresentation()
{
    RoadHost host;
    QSignalSpy finished(&host.picker, &FVColorPickerViewController::colorPickerDidFinish);
    host.picker.present(&host.window);
    // Even before anything is shown.
    host.picker.dismiss();
    QCOMPARE(host.picker.state(), State::Stopping);
    QTRY_COMPARE(finished.size(), 1);
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    host.picker.dismiss();
    QTRY_COMPARE(finished.size(), 2);
    QVERIFY(host.picks.empty());
}

void PickerRoadTest::aGestureThatTheEndCutsOffIsMadeFinal()
{
    RoadHost host;
    QSignalSpy finished(&host.picker, &FVColorPickerViewController::colorPickerDidFinish);
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
    QTRY_VERIFY(host.picks.size() >= 2);
    host.picker.dismiss();
    QTRY_COMPARE(finished.size(), 1);
    QVERIFY(!host.picks.back().isVolatile);
    QCOMPARE(host.picks.back().color, FVColor(1, 1, 1));
    QTest::mouseRelease(&host.window, Qt::LeftButton, {}, QPoint(5, 5));
}

void PickerRoadTest::anEmbeddedPickerFillsItsContainer()
{
    RoadHost host;
    QQuickItem container(host.window.contentItem());
    container.setPosition(QPointF(30, 40));
    container.setSize(QSizeF(360, 500));
    host.picker.embed(&container);
    QTRY_VERIFY(host.isReady());
    QCOMPARE(host.picker.view()->size(), container.size());
    QVERIFY(!host.picker.wantsMaterial());
    QTest::mouseClick(&host.window, Qt::LeftButton, {}, host.swatch(0, 11));
    QTRY_VERIFY(!host.picks.empty() && !host.picks.back().isVolatile);
    QCOMPARE(host.picks.back().color, FVColor(0, 0, 0));
    container.setSize(QSizeF(420, 500));
    QTest::mouseClick(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
    QTRY_COMPARE(host.picks.back().color, FVColor(1, 1, 1));
}

void PickerRoadTest::nothingIsDrawnWhileTheAppHidesThePicker()
{
    RoadHost host;
    QQuickItem container(host.window.contentItem());
    container.setSize(QSizeF(360, 560));
    host.picker.embed(&container);
    QTRY_VERIFY(host.isReady());
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

void PickerRoadTest::aServiceThatCannotRunIsReported_data()
{
    QTest::addColumn<QByteArray>("program");
    QTest::newRow("missing") << QByteArray("/nonexistent/service");
    QTest::newRow("ends at once") << QByteArray("/bin/true");
    QTest::newRow("no program") << QByteArray("/etc/passwd");
}

void PickerRoadTest::aServiceThatCannotRunIsReported()
{
    QFETCH(QByteArray, program);
    qputenv("FAVRIN_COLOR_PICKER_SERVICE", program);
    RoadHost host;
    QSignalSpy terminated(&host.picker, &FVColorPickerViewController::colorPickerViewServiceDidTerminateWithError);
    host.picker.present(&host.window);
    QTRY_COMPARE(terminated.size(), 1);
    QCOMPARE(host.picker.state(), State::Failed);
}

void PickerRoadTest::aServiceStartedAheadIsTheOneThatIsShown()
{
    FVColorPickerViewController::startServiceAhead();
    FVColorPickerViewController::startServiceAhead();
    QTRY_COMPARE(servicesOf(getpid()).size(), std::size_t(1));
    const auto ahead = servicesOf(getpid());
    RoadHost host;
    host.picker.setSelectedColor(FVColor(1, 1, 1));
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    QCOMPARE(servicesOf(getpid()), ahead);
    // What it said while nobody listened counts all the same.
    QVERIFY(host.picker.wantsMaterial());
    QCOMPARE(host.picker.preferredContentSize().width(), 568.0);
    QTest::mouseClick(&host.window, Qt::LeftButton, {}, host.swatch(0, 11));
    QTRY_VERIFY(!host.picks.empty() && !host.picks.back().isVolatile);
    QCOMPARE(host.picks.back().color, FVColor(0, 0, 0));
}

void PickerRoadTest::aWideDisplayIsDrawnAndPickedInDisplayP3()
{
    RoadHost host;
    host.picker.setDisplayGamut(FVColorPickerViewController::DisplayGamut::P3);
    host.picker.setReduceMotion(true);
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    // sRGB B51A00, in Display P3.
    const QPoint swatch = host.swatch(3, 5);
    QTest::mouseClick(&host.window, Qt::LeftButton, {}, swatch);
    QTRY_VERIFY(!host.picks.empty() && !host.picks.back().isVolatile);
    const FVColor picked = host.picks.back().color;
    QCOMPARE(host.picks.back().space, FVColor::displayP3Name());
    QVERIFY(std::abs(picked.red() - 0.6521) < 0.001 && std::abs(picked.green() - 0.1721) < 0.001);
    QCOMPARE(picked.toQColor(), QColor(0xB5, 0x1A, 0x00));
    // The pixels hold the same numbers: the host said that it shows them as Display P3.
    const QColor expected = QColor::fromRgbF(float(picked.red()), float(picked.green()), float(picked.blue()));
    QTRY_COMPARE(host.window.grabWindow().pixel(swatch), expected.rgb());
}

void PickerRoadTest::theWindowMayGoWhileThePickerIsShown()
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
    QObject::connect(&host.picker, &FVColorPickerViewController::stateChanged, &host.window, [&host] {
        if (host.isReady())
            say(QStringLiteral("ready"));
    });
    QObject::connect(&host.picker, &FVColorPickerViewController::pickerDidSelectColor, &host.window,
                     [](const FVColor &color, const QString &space, bool isVolatile) {
                         say(QStringLiteral("pick %1 %2 %3 %4 %5 %6")
                                 .arg(color.red())
                                 .arg(color.green())
                                 .arg(color.blue())
                                 .arg(color.alpha())
                                 .arg(space, isVolatile ? QStringLiteral("volatile") : QStringLiteral("final")));
                     });
    QObject::connect(&host.picker, &FVColorPickerViewController::colorPickerDidFinish, &host.window,
                     [] { say(QStringLiteral("finished")); });
    host.picker.setSelectedColor(FVColor(1, 1, 1));
    host.picker.present(&host.window);
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
