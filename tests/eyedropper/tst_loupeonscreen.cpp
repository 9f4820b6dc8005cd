#include "apps/eyedropper/picker/screenpicture.h"
#include "apps/eyedropper/pickerlines.h"

#include "virtualscreen.h"

#include <QImage>
#include <QTest>

#include <memory>

#include <xcb/xcb.h>

using namespace favrin;
using namespace favrin::eyedropper;

namespace {

/** A picture in which no two neighbors are alike, and every place has a color of its own. */
QImage testPicture(QSize size)
{
    QImage picture(size, QImage::Format_RGB32);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x)
            picture.setPixel(x, y, qRgb(x & 255, y & 255, ((x >> 8) << 4 | (y >> 8)) * 5));
    }
    return picture;
}

} // namespace

/** The picking process on a real X server whose picture is known. */
class TestLoupeOnScreen : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY2(m_screen.start(), "Xvfb cannot be started");
        m_connection.reset(xcb_connect(m_screen.name().toLatin1().constData(), nullptr));
        QCOMPARE(xcb_connection_has_error(m_connection.get()), 0);
        showOnRoot(m_connection.get(), m_picture);
        QCOMPARE(screenNow(), m_picture);
        connect(&m_picker, &QProcess::readyReadStandardOutput, this,
                [this] { m_written += m_picker.readAllStandardOutput(); });
        m_picker.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    }

    void init() { m_written.clear(); }

    void cleanup()
    {
        m_picker.closeWriteChannel();
        QTRY_COMPARE(m_picker.state(), QProcess::NotRunning);
        QTRY_VERIFY(screenNow() == m_picture);
    }

    void theCheckFindsTheScreen()
    {
        QVERIFY(m_screen.run(QStringLiteral(FAVRIN_EYEDROPPER_PICKER), {QStringLiteral("--check")}));
    }

    void aClickPicksItsPixel_data()
    {
        QTest::addColumn<QPoint>("pixel");
        QTest::addColumn<QString>("scale");
        const QList<QPoint> pixels = {{500, 400}, {0, 0}, {999, 799}, {0, 799}, {731, 13}};
        for (const QPoint pixel : pixels) {
            for (const char *scale : {"1", "2", "1.5"})
                QTest::addRow("%d,%d at %sx", pixel.x(), pixel.y(), scale) << pixel << QString::fromLatin1(scale);
        }
    }

    void aClickPicksItsPixel()
    {
        QFETCH(QPoint, pixel);
        QFETCH(QString, scale);
        start(scale);
        floatIt();
        moveTo(pixel);
        QVERIFY(m_screen.input({QStringLiteral("click"), QStringLiteral("1")}));
        QTRY_COMPARE(m_picker.state(), QProcess::NotRunning);
        QCOMPARE(m_picker.exitCode(), 0);
        QCOMPARE(colors(), QList<QRgb>{m_picture.pixel(pixel)});
    }

    void arrowKeysMoveByPixels()
    {
        moveTo({300, 200});
        start();
        floatIt();
        // Two to the right, one down, ten up.
        for (const char *key : {"Right", "Right", "Down", "shift+Up", "Left", "Right", "Return"})
            press(QString::fromLatin1(key));
        QTRY_COMPARE(m_picker.state(), QProcess::NotRunning);
        QCOMPARE(colors(), QList<QRgb>{m_picture.pixel(302, 191)});
    }

    void waysOut_data()
    {
        QTest::addColumn<QStringList>("input");
        QTest::newRow("Escape") << QStringList{QStringLiteral("key"), QStringLiteral("Escape")};
        QTest::newRow("right click") << QStringList{QStringLiteral("click"), QStringLiteral("3")};
    }

    void waysOut()
    {
        QFETCH(QStringList, input);
        start();
        floatIt();
        QVERIFY(m_screen.input(input));
        QTRY_COMPARE(m_picker.state(), QProcess::NotRunning);
        QCOMPARE(m_picker.exitCode(), 0);
        QVERIFY(colors().isEmpty());
    }

    void beforeItFloatsItFollowsAndHearsNothing()
    {
        moveTo({200, 200});
        start();
        const QImage before = screenNow();
        moveTo({700, 500});
        QTRY_VERIFY(screenNow() != before);
        QVERIFY(m_screen.input({QStringLiteral("click"), QStringLiteral("1")}));
        QVERIFY(m_screen.input({QStringLiteral("click"), QStringLiteral("3")}));
        floatIt();
        QCOMPARE(m_picker.state(), QProcess::Running);
        QVERIFY(colors().isEmpty());
        press(QStringLiteral("Return"));
        QTRY_COMPARE(colors(), QList<QRgb>{m_picture.pixel(700, 500)});
    }

    void theServicesEndEndsIt()
    {
        start();
        m_picker.closeWriteChannel();
        QTRY_COMPARE(m_picker.state(), QProcess::NotRunning);
        QCOMPARE(m_picker.exitCode(), 0);
    }

    void theLoupeIsSeen_data()
    {
        QTest::addColumn<QString>("scale");
        QTest::addColumn<int>("cell");
        QTest::newRow("1x") << QStringLiteral("1") << 11;
        QTest::newRow("2x") << QStringLiteral("2") << 22;
    }

    void theLoupeIsSeen()
    {
        QFETCH(QString, scale);
        QFETCH(int, cell);
        const QPoint pixel(500, 400);
        start(scale);
        floatIt();
        moveTo({510, 410});
        moveTo(pixel);
        // Around the pointer the pixels are seen magnified, the pointer's own in the middle.
        const auto shows = [&](QPoint offset) {
            return screenNow().pixel(pixel + offset * cell) == m_picture.pixel(pixel + offset);
        };
        QTRY_VERIFY(shows({0, 0}) && shows({3, 0}));
        QVERIFY(shows({-3, 0}));
        QVERIFY(shows({0, 3}));
        QVERIFY(shows({0, -3}));
        QVERIFY(shows({-4, 4}));
    }

private:
    void start(const QString &scale = {})
    {
        auto environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("DISPLAY"), m_screen.name());
        if (!scale.isEmpty())
            environment.insert(QStringLiteral("QT_SCALE_FACTOR"), scale);
        m_picker.setProcessEnvironment(environment);
        m_picker.start(QStringLiteral(FAVRIN_EYEDROPPER_PICKER), {QStringLiteral("--pick"), QStringLiteral("nowhere")});
        // The loupe is there.
        QTRY_VERIFY(screenNow() != m_picture);
    }

    void floatIt()
    {
        m_picker.write("float\n");
        QTRY_VERIFY(m_written.contains("floated\n"));
    }

    void moveTo(QPoint pixel) const
    {
        QVERIFY(m_screen.input({QStringLiteral("mousemove"), QString::number(pixel.x()), QString::number(pixel.y())}));
    }
    void press(const QString &key) const { QVERIFY(m_screen.input({QStringLiteral("key"), key})); }
    /** The lines that the picker wrote and that stand for colors. */
    QList<QRgb> colors() const
    {
        QList<QRgb> found;
        for (const QByteArray &line : m_written.split('\n')) {
            if (const auto color = pickerlines::colorFromLine(line)) {
                const auto components = color->components();
                found << qRgb(qRound(components[0] * 255), qRound(components[1] * 255), qRound(components[2] * 255));
            }
        }
        return found;
    }

    QImage screenNow() const
    {
        return pictureOfScreen(m_connection.get()).value_or(QImage()).convertToFormat(QImage::Format_RGB32);
    }

    VirtualScreen m_screen;
    QImage m_picture = testPicture(QSize(1000, 800));
    std::unique_ptr<xcb_connection_t, decltype(&xcb_disconnect)> m_connection{nullptr, &xcb_disconnect};
    QProcess m_picker;
    QByteArray m_written;
};

QTEST_GUILESS_MAIN(TestLoupeOnScreen)
#include "tst_loupeonscreen.moc"
