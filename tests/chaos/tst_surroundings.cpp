#include "chaoshost.h"

#include "../eyedropper/privatebus.h"

#include <map>

namespace {

using Variables = std::map<QByteArray, QByteArray>;

/** Changes this process's environment, which the picker's process inherits; an empty value takes a variable away. */
class Surroundings
{
public:
    explicit Surroundings(const Variables &variables)
    {
        for (const auto &[name, value] : variables) {
            m_before[name] = qgetenv(name.constData());
            set(name, value);
        }
    }
    ~Surroundings()
    {
        for (const auto &[name, value] : m_before)
            set(name, value);
    }
    Surroundings(const Surroundings &) = delete;
    Surroundings &operator=(const Surroundings &) = delete;

private:
    static void set(const QByteArray &name, const QByteArray &value)
    {
        if (value.isEmpty())
            qunsetenv(name.constData());
        else
            qputenv(name.constData(), value);
    }

    Variables m_before;
};

/** What the system says of a process, with single blanks. */
QByteArray told(const char *what, pid_t process)
{
    QFile file(QStringLiteral("/proc/%1/%2").arg(process).arg(QString::fromLatin1(what)));
    return file.open(QIODevice::ReadOnly) ? file.readAll().simplified() : QByteArray();
}

} // namespace

Q_DECLARE_METATYPE(Variables)

/** The picker works wherever it is started, and keeps to what it needs. */
class SurroundingsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { QTRY_VERIFY(servicesOf(getpid()).empty()); }

    void oddEnvironments_data()
    {
        QTest::addColumn<Variables>("variables");
        const auto row = [](const char *name, const Variables &variables) { QTest::newRow(name) << variables; };
        row("a locale that does not exist", {{"LC_ALL", "xx_YY.UTF-7"}, {"LANG", "nonsense"}, {"LANGUAGE", "a:b::"}});
        row("no locale", {{"LC_ALL", ""}, {"LANG", ""}});
        row("a time zone that does not exist", {{"TZ", ":/nowhere"}});
        row("no home", {{"HOME", ""}, {"XDG_DATA_HOME", ""}, {"FAVRIN_DEFAULTS_FILE", ""}, {"XDG_CACHE_HOME", ""}});
        row("a home that cannot be", {{"HOME", "/proc/none"}, {"XDG_DATA_HOME", ""}, {"FAVRIN_DEFAULTS_FILE", ""}});
        row("no folder for what runs", {{"XDG_RUNTIME_DIR", "/nowhere"}, {"TMPDIR", "/nowhere"}});
        row("no bus at its address", {{"DBUS_SESSION_BUS_ADDRESS", "unix:path=/nowhere/bus"}});
        row("an address that is none", {{"DBUS_SESSION_BUS_ADDRESS", "!%zz;;"}});
        row("a bus over the network", {{"DBUS_SESSION_BUS_ADDRESS", "tcp:host=127.0.0.1,port=9"}});
        row("Vulkan on any device", {{"FAVRIN_GPU", "vulkan"}});
        row("without confinement", {{"FAVRIN_CONFINEMENT", "off"}});
    }

    void oddEnvironments()
    {
        QFETCH(Variables, variables);
        const Surroundings surroundings(variables);
        ChaosHost host;
        QVERIFY(host.present());
        // The spectrum: with its renderer, where there is one.
        host.click(host.tabSegment(1));
        QVERIFY(host.picksAt(host.inTab(0.5, 0.5)));
        host.click(host.tabSegment(0));
        QVERIFY(host.isUnharmed());
    }

    void theBusMayGo()
    {
        PrivateBus bus;
        QVERIFY(bus.start());
        const Surroundings surroundings(
            {{"DBUS_SESSION_BUS_ADDRESS", bus.address().toUtf8()}, {"QT_LINUX_ACCESSIBILITY_ALWAYS_ON", "1"}});
        ChaosHost host;
        QVERIFY(host.present());
        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        QTRY_VERIFY(!host.picks.empty());
        bus.stop();
        for (int step = 1; step < 40; ++step) {
            host.dragStep(step);
            QCoreApplication::processEvents();
        }
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, host.swatch(0, 11));
        QTRY_VERIFY(host.hasFinalPick());
        QVERIFY(host.isUnharmed());
    }

    void theLanguageMayChange()
    {
        ChaosHost host;
        QVERIFY(host.present());
        for (const char *name : {"de", "ar-EG", "zh-Hant-TW", "xx", "C"}) {
            host.picker.setLocale(QLocale(QString::fromLatin1(name)));
            host.picker.setLayoutDirection(host.picker.locale().textDirection());
            // Back again, since the places that this test clicks at are those of one direction.
            host.picker.setLayoutDirection(Qt::LeftToRight);
            QVERIFY(host.picksAt(host.swatch(4, 4)));
        }
    }

    void theProcessIsConfined()
    {
        // What the app has open and is not the picker's business.
        QFile secret(m_folder.filePath(QStringLiteral("secret")));
        QVERIFY(secret.open(QIODevice::WriteOnly));
        const int inherited = ::dup(secret.handle());
        const Surroundings surroundings(Variables{{"A_PASSWORD", "secret"}});
        ChaosHost host;
        QVERIFY(host.present());
        const pid_t service = servicesOf(getpid()).at(0);
        QVERIFY(told("status", service).contains("NoNewPrivs: 1 Seccomp: 2 "));
        const QDir files(QStringLiteral("/proc/%1/fd").arg(service));
        for (const auto &entry : files.entryList(QDir::AllEntries | QDir::System | QDir::NoDotAndDotDot))
            QVERIFY(QFile::symLinkTarget(files.filePath(entry)) != secret.fileName());
        QCOMPARE(QFile::symLinkTarget(files.filePath(QStringLiteral("0"))), QStringLiteral("/dev/null"));
        const QByteArray variables = told("environ", service);
        QVERIFY(variables.contains("FAVRIN_DEFAULTS_FILE=") && !variables.contains("A_PASSWORD"));
        QVERIFY(told("limits", service).contains("Max core file size 1 1 bytes"));
        ::close(inherited);
    }

private:
    Settings m_settings;
    QTemporaryDir m_folder;
};

QTEST_MAIN(SurroundingsTest)
#include "tst_surroundings.moc"
