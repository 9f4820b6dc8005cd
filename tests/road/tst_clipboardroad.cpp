#include "roadtest.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMimeData>

/** What the user copies in the picker, as other apps get it from the host. */
class ClipboardRoadTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void theWellIsCopied_data();
    void theWellIsCopied();
};

void ClipboardRoadTest::theWellIsCopied_data()
{
    QTest::addColumn<FVColor>("color");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QColor>("desktopColor");
    QTest::newRow("sRGB") << FVColor(0, 97 / 255.0, 253 / 255.0) << QStringLiteral("#0061FD") << QColor(0, 97, 253);
    QTest::newRow("translucent") << FVColor(1, 0, 0, 0.2) << QStringLiteral("#FF000033") << QColor(255, 0, 0, 51);
    QTest::newRow("Display P3") << FVColor(1, 0.5, 0.25, 1, FVColor::displayP3Name())
                                << QStringLiteral("color(display-p3 1 0.5 0.25)") << QColor(255, 118, 38);
}

void ClipboardRoadTest::theWellIsCopied()
{
    QFETCH(FVColor, color);
    QFETCH(QString, text);
    QFETCH(QColor, desktopColor);
    QGuiApplication::clipboard()->clear();
    RoadHost host(QSize(420, 800));
    host.window.requestActivate();
    host.picker.setSelectedColor(color);
    host.picker.setShowsAlpha(true);
    host.picker.present(&host.window);
    QTRY_VERIFY(host.isReady());
    // Backward from the start lies the strip of the favorites, and before it the well.
    QTest::keyClick(&host.window, Qt::Key_Backtab, Qt::ShiftModifier);
    QTest::keyClick(&host.window, Qt::Key_Backtab, Qt::ShiftModifier);
    QTest::keyClick(&host.window, Qt::Key_C, Qt::ControlModifier);
    QTRY_COMPARE(QGuiApplication::clipboard()->text(), text);
    const auto copied = QGuiApplication::clipboard()->mimeData()->colorData().value<QColor>();
    QCOMPARE(copied.rgba(), desktopColor.rgba());
}

QTEST_MAIN(ClipboardRoadTest)
#include "tst_clipboardroad.moc"
