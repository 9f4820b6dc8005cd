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
    void initTestCase()
    {
        qputenv("FAVRIN_DEFAULTS_FILE", (m_data.path() + QStringLiteral("/defaults.sqlite")).toUtf8());
        const std::unique_ptr<xcb_connection_t, decltype(&xcb_disconnect)> connection(xcb_connect(nullptr, nullptr),
                                                                                      &xcb_disconnect);
        QImage picture(1000, 800, QImage::Format_RGB32);
        picture.fill(sampled);
        showOnRoot(connection.get(), picture);
    }

    void init()
    {
        m_host = std::make_unique<RoadHost>(QSize(800, 700));
        m_heard.clear();
        const auto hears = [this](auto signal, const char *word) {
            connect(&m_host->picker, signal, this, [this, word] { m_heard << QString::fromLatin1(word); });
        };
        hears(&FVColorPickerViewController::pickerDidShowEyedropper, "show");
        hears(&FVColorPickerViewController::pickerDidFloatEyedropper, "float");
        hears(&FVColorPickerViewController::pickerDidDismissEyedropper, "dismiss");
        // The bus starts the service to answer.
        QTRY_VERIFY(m_host->picker.isEyedropperAvailable());
        QVERIFY(m_host->present());
    }

    void cleanup()
    {
        m_host.reset();
        QTRY_VERIFY(servicesOf(getpid()).empty());
        // The eyedropper leaves with the picker that asked for it.
        QTRY_VERIFY(pickingProcesses().empty());
    }

    void aSampledColorReachesTheHostTwice()
    {
        for (int use = 1; use <= 2; ++use) {
            m_heard.clear();
            m_host->picks.clear();
            useEyedropper();
            // Outside the window, where only the screen is.
            point({900, 750});
            act(QStringLiteral("click"), QStringLiteral("1"));
            QTRY_COMPARE(m_heard, wholeUse);
            QTRY_COMPARE(m_host->picks.size(), std::size_t(2));
            const FVColor color(sampled.red() / 255.0, sampled.green() / 255.0, sampled.blue() / 255.0);
            QCOMPARE(m_host->picks[0], (RoadHost::Pick{color, QString(), false}));
            QCOMPARE(m_host->picks[1], (RoadHost::Pick{color, FVColor::sRGBName(), false}));
        }
    }

    void whileItShowsThePickerIsLocked()
    {
        useEyedropper();
        // Past the loupe's window, straight to the app's.
        m_host->click(m_host->swatch(0, 0));
        QTest::keyClick(&m_host->window, Qt::Key_Escape);
        // This key is the eyedropper's, not the picker's.
        act(QStringLiteral("key"), QStringLiteral("Escape"));
        QTRY_COMPARE(m_heard, wholeUse);
        QVERIFY(m_host->picks.empty());
        QVERIFY(m_host->isReady());
    }

    void aCrashOfThePickingDismisses()
    {
        useEyedropper();
        for (const pid_t process : pickingProcesses())
            ::kill(process, SIGABRT);
        QTRY_COMPARE(m_heard, wholeUse);
        // The picker can be touched again.
        point(m_host->swatch(0, 0));
        act(QStringLiteral("click"), QStringLiteral("1"));
        QTRY_VERIFY(m_host->hasFinalPick());
    }

private:
    const QStringList wholeUse = {QStringLiteral("show"), QStringLiteral("float"), QStringLiteral("dismiss")};

    void point(QPoint inWindow)
    {
        const QPoint pixel = m_host->window.mapToGlobal(inWindow);
        QVERIFY(m_screen.input({QStringLiteral("mousemove"), QString::number(pixel.x()), QString::number(pixel.y())}));
    }
    void act(const QString &how, const QString &what) { QVERIFY(m_screen.input({how, what})); }
    void useEyedropper()
    {
        point(m_host->picker.view()->mapToScene(QPointF(m_host->padding() + 10, 55.0 / 2)).toPoint());
        act(QStringLiteral("mousedown"), QStringLiteral("1"));
        QTRY_COMPARE(m_heard, wholeUse.mid(0, 1));
        QTRY_VERIFY(!pickingProcesses().empty());
        act(QStringLiteral("mouseup"), QStringLiteral("1"));
        QTRY_COMPARE(m_heard, wholeUse.mid(0, 2));
        QVERIFY(m_host->picks.empty());
    }

    VirtualScreen &m_screen;
    QTemporaryDir m_data;
    std::unique_ptr<RoadHost> m_host;
    QStringList m_heard;
};

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
