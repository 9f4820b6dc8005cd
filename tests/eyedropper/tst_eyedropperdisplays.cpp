#include "../road/roadhost.h"
#include "privatebus.h"
#include "scriptedservice.h"

#include <QGuiApplication>
#include <QScreen>

using namespace favrin;

namespace {

constexpr char twoDisplays[] = R"({ "synchronousWindowSystemEvents": true, "screens": [
    { "name": "left", "x": 0, "y": 0, "width": 1000, "height": 800, "logicalDpi": 96, "logicalBaseDpi": 96, "dpr": 1 },
    { "name": "right", "x": 1000, "y": 0, "width": 1200, "height": 900, "logicalDpi": 96, "logicalBaseDpi": 96, "dpr": 1 }
] })";

} // namespace

/** The real picker's process, told of the display by its host. */
class TestEyedropperDisplays : public QObject
{
    Q_OBJECT

public:
    explicit TestEyedropperDisplays(const PrivateBus &bus) : m_bus(bus) {}

private Q_SLOTS:
    void theDisplayThatShowsThePickerIsNamed()
    {
        qputenv("FAVRIN_DEFAULTS_FILE", (m_data.path() + QStringLiteral("/defaults.sqlite")).toUtf8());
        QCOMPARE(QGuiApplication::screens().size(), 2);
        ScriptedService service(m_bus.connection());
        RoadHost host;
        host.window.setPosition(1100, 50);
        QTRY_COMPARE(host.window.screen()->name(), QStringLiteral("right"));
        host.picker.present(&host.window);
        QTRY_VERIFY(host.isReady());

        int dismissals = 0;
        connect(&host.picker, &FVColorPickerViewController::pickerDidDismissEyedropper, &host.window,
                [&dismissals] { ++dismissals; });
        const auto use = [&] {
            const QPoint button = host.picker.view()->mapToScene(QPointF(host.padding() + 10, 55.0 / 2)).toPoint();
            const auto before = service.messages.size();
            QTest::mousePress(&host.window, Qt::LeftButton, {}, button);
            QTRY_COMPARE(service.messages.size(), before + 1);
            QTest::mouseRelease(&host.window, Qt::LeftButton, {}, button);
            QTRY_COMPARE(service.messages.size(), before + 2);
            const int heard = dismissals;
            service.say(QStringLiteral("eyedropperDidDismiss"));
            QTRY_COMPARE(dismissals, heard + 1);
        };
        use();
        host.window.setPosition(50, 50);
        QTRY_COMPARE(host.window.screen()->name(), QStringLiteral("left"));
        // The host tells of it before this turn of the event loop ends.
        QCoreApplication::processEvents();
        use();
        const QString floatIt = QStringLiteral("floatEyeDropper");
        QCOMPARE(service.messages, (QStringList{QStringLiteral("beginShowingEyeDropper right"), floatIt,
                                                QStringLiteral("beginShowingEyeDropper left"), floatIt}));
    }

private:
    const PrivateBus &m_bus;
    QTemporaryDir m_data;
};

int main(int argc, char *argv[])
{
    QTemporaryDir folder;
    QFile displays(folder.filePath(QStringLiteral("displays.json")));
    if (!displays.open(QIODevice::WriteOnly) || displays.write(twoDisplays) < 0)
        return 1;
    displays.close();
    PrivateBus bus;
    if (!bus.start())
        return 1;
    qputenv("DBUS_SESSION_BUS_ADDRESS", bus.address().toLatin1());
    qputenv("QT_QPA_PLATFORM", "offscreen:configfile=" + displays.fileName().toUtf8());
    QGuiApplication application(argc, argv);
    TestEyedropperDisplays test(bus);
    return QTest::qExec(&test, argc, argv);
}

#include "tst_eyedropperdisplays.moc"
