#include "../eyedropper/privatebus.h"
#include "../eyedropper/virtualscreen.h"
#include "roadhost.h"

#include "eyedropper/wirenames.h"

#include <QDBusConnectionInterface>
#include <QDBusMessage>
#include <QGuiApplication>

#include <memory>

namespace {

const QColor sampled(0x12, 0x34, 0x56);

/** The picking processes on this test's screen; other tests may have theirs. */
std::vector<pid_t> pickingProcesses()
{
    std::vector<pid_t> found;
    const QByteArray screen = "DISPLAY=" + qgetenv("DISPLAY");
    const QDir processes(QStringLiteral("/proc"));
    for (const auto &name : processes.entryList(QDir::Dirs)) {
        const auto program = QFile::symLinkTarget(QStringLiteral("/proc/%1/exe").arg(name));
        QFile environment(QStringLiteral("/proc/%1/environ").arg(name));
        if (program == QStringLiteral(FAVRIN_EYEDROPPER_PICKER) && environment.open(QIODevice::ReadOnly) &&
            environment.readAll().split('\0').contains(screen))
            found.push_back(name.toInt());
    }
    return found;
}

} // namespace

/** From the finger on the eyedropper button to the color in the host, through all real processes and a real screen. */
class EyedropperRoadTest : public QObject
{
    Q_OBJECT

public:
    explicit EyedropperRoadTest(VirtualScreen &screen) : m_screen(screen) {}

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

    void aSampledColorReachesTheHostTwice();
    void escapeDismisses();
    void aCrashOfThePickingDismisses();
    void whileItShowsThePickerIsLocked();

private:
    void point(QPoint inWindow)
    {
        const QPoint pixel = m_host->window.mapToGlobal(inWindow);
        QVERIFY(m_screen.input({QStringLiteral("mousemove"), QString::number(pixel.x()), QString::number(pixel.y())}));
    }
    void act(const QString &how, const QString &what) { QVERIFY(m_screen.input({how, what})); }
    QPoint eyedropperButton() const
    {
        return m_host->picker.view()->mapToScene(QPointF(m_host->padding() + 10, 55.0 / 2)).toPoint();
    }
    void useEyedropper();

    VirtualScreen &m_screen;
    QTemporaryDir m_data;
    std::unique_ptr<RoadHost> m_host;
    QStringList m_heard;
};

void EyedropperRoadTest::initTestCase()
{
    qputenv("FAVRIN_DEFAULTS_FILE", (m_data.path() + QStringLiteral("/defaults.sqlite")).toUtf8());
    const std::unique_ptr<xcb_connection_t, decltype(&xcb_disconnect)> connection(xcb_connect(nullptr, nullptr),
                                                                                  &xcb_disconnect);
    QImage picture(1000, 800, QImage::Format_RGB32);
    picture.fill(sampled);
    showOnRoot(connection.get(), picture);
}

void EyedropperRoadTest::init()
{
    m_host = std::make_unique<RoadHost>(QSize(800, 700));
    m_heard.clear();
    auto &picker = m_host->picker;
    connect(&picker, &FVColorPickerViewController::pickerDidShowEyedropper, this,
            [this] { m_heard << QStringLiteral("show"); });
    connect(&picker, &FVColorPickerViewController::pickerDidFloatEyedropper, this,
            [this] { m_heard << QStringLiteral("float"); });
    connect(&picker, &FVColorPickerViewController::pickerDidDismissEyedropper, this,
            [this] { m_heard << QStringLiteral("dismiss"); });
    // The bus starts the service to answer.
    QTRY_VERIFY(picker.isEyedropperAvailable());
    picker.present(&m_host->window);
    QTRY_VERIFY(m_host->isReady());
}

void EyedropperRoadTest::cleanup()
{
    m_host.reset();
    QTRY_VERIFY(servicesOf(getpid()).empty());
    // The eyedropper leaves with the picker that asked for it.
    QTRY_VERIFY(pickingProcesses().empty());
}

void EyedropperRoadTest::useEyedropper()
{
    point(eyedropperButton());
    act(QStringLiteral("mousedown"), QStringLiteral("1"));
    QTRY_COMPARE(m_heard, QStringList{QStringLiteral("show")});
    QTRY_VERIFY(!pickingProcesses().empty());
    act(QStringLiteral("mouseup"), QStringLiteral("1"));
    QTRY_COMPARE(m_heard.size(), 2);
    QCOMPARE(m_heard[1], QStringLiteral("float"));
    QVERIFY(m_host->picks.empty());
}

void EyedropperRoadTest::aSampledColorReachesTheHostTwice()
{
    for (int use = 1; use <= 2; ++use) {
        m_heard.clear();
        m_host->picks.clear();
        useEyedropper();
        // Outside the window, where only the screen is.
        point({900, 750});
        act(QStringLiteral("click"), QStringLiteral("1"));
        QTRY_COMPARE(m_heard.size(), 3);
        QCOMPARE(m_heard[2], QStringLiteral("dismiss"));
        QTRY_COMPARE(m_host->picks.size(), std::size_t(2));
        const FVColor color(sampled.red() / 255.0, sampled.green() / 255.0, sampled.blue() / 255.0);
        QVERIFY2(m_host->picks[0].color == color, qPrintable(m_host->picks[0].color.toQColor().name()));
        QCOMPARE(m_host->picks[0].space, QString());
        QCOMPARE(m_host->picks[1].color, color);
        QCOMPARE(m_host->picks[1].space, FVColor::sRGBName());
        QVERIFY(!m_host->picks[0].isVolatile && !m_host->picks[1].isVolatile);
    }
}

void EyedropperRoadTest::escapeDismisses()
{
    useEyedropper();
    act(QStringLiteral("key"), QStringLiteral("Escape"));
    QTRY_COMPARE(m_heard.size(), 3);
    QCOMPARE(m_heard[2], QStringLiteral("dismiss"));
    QVERIFY(m_host->picks.empty());
    // The key was the eyedropper's, not the picker's.
    QVERIFY(m_host->isReady());
}

void EyedropperRoadTest::aCrashOfThePickingDismisses()
{
    useEyedropper();
    for (const pid_t process : pickingProcesses())
        ::kill(process, SIGABRT);
    QTRY_COMPARE(m_heard.size(), 3);
    QCOMPARE(m_heard[2], QStringLiteral("dismiss"));
    // The picker can be touched again.
    point(m_host->swatch(0, 0));
    act(QStringLiteral("click"), QStringLiteral("1"));
    QTRY_VERIFY(!m_host->picks.empty() && !m_host->picks.back().isVolatile);
}

void EyedropperRoadTest::whileItShowsThePickerIsLocked()
{
    useEyedropper();
    // Past the loupe's window, straight to the app's.
    QTest::mouseClick(&m_host->window, Qt::LeftButton, {}, m_host->swatch(0, 0));
    QTest::keyClick(&m_host->window, Qt::Key_Escape);
    act(QStringLiteral("key"), QStringLiteral("Escape"));
    QTRY_COMPARE(m_heard.size(), 3);
    QVERIFY(m_host->picks.empty());
    QVERIFY(m_host->isReady());
}

int main(int argc, char *argv[])
{
    VirtualScreen screen;
    PrivateBus bus;
    bus.addService(favrin::eyedropper::serviceName, QStringLiteral(FAVRIN_EYEDROPPER_SERVICE));
    if (!screen.start())
        return 1;
    // Everything that is started from here on lives on this screen and this bus.
    qputenv("DISPLAY", screen.name().toLatin1());
    qunsetenv("WAYLAND_DISPLAY");
    qunsetenv("XDG_SESSION_TYPE");
    if (!bus.start())
        return 1;
    qputenv("DBUS_SESSION_BUS_ADDRESS", bus.address().toLatin1());
    qputenv("QT_QPA_PLATFORM", "xcb");
    QGuiApplication application(argc, argv);
    EyedropperRoadTest test(screen);
    return QTest::qExec(&test, argc, argv);
}

#include "tst_eyedropperroad.moc"
