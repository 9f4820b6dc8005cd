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

QByteArray statusOf(pid_t process, const QByteArray &field)
{
    QFile file(QStringLiteral("/proc/%1/status").arg(process));
    if (!file.open(QIODevice::ReadOnly))
        return {};
    for (const auto &line : file.readAll().split('\n')) {
        if (line.startsWith(field + ':'))
            return line.mid(field.size() + 1).trimmed();
    }
    return {};
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
        host.present();
        QTRY_VERIFY(host.isReady());
        // The spectrum: with its renderer, where there is one.
        host.click(host.tabSegment(1));
        host.click(host.inTab(0.5, 0.5));
        QTRY_VERIFY(!host.picks.empty() && !host.picks.back().isVolatile);
        host.click(host.tabSegment(0));
        QVERIFY(host.terminated.isEmpty());
    }

    void theBusMayGo()
    {
        PrivateBus bus;
        QVERIFY(bus.start());
        const Surroundings surroundings(
            {{"DBUS_SESSION_BUS_ADDRESS", bus.address().toUtf8()}, {"QT_LINUX_ACCESSIBILITY_ALWAYS_ON", "1"}});
        ChaosHost host;
        host.present();
        QTRY_VERIFY(host.isReady());
        QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        QTRY_VERIFY(!host.picks.empty());
        bus.stop();
        for (int step = 1; step < 40; ++step) {
            host.dragStep(step);
            QCoreApplication::processEvents();
        }
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, host.swatch(0, 11));
        QTRY_VERIFY(!host.picks.back().isVolatile);
        QVERIFY(host.isReady() && host.terminated.isEmpty());
    }

    void theLanguageMayChange()
    {
        ChaosHost host;
        host.present();
        QTRY_VERIFY(host.isReady());
        for (const char *name : {"de", "ar-EG", "zh-Hant-TW", "xx", "C"}) {
            host.picker.setLocale(QLocale(QString::fromLatin1(name)));
            host.picker.setLayoutDirection(host.picker.locale().textDirection());
            // Back again, since the places that this test clicks at are those of one direction.
            host.picker.setLayoutDirection(Qt::LeftToRight);
            host.picks.clear();
            host.click(host.swatch(4, 4));
            QTRY_VERIFY(!host.picks.empty() && !host.picks.back().isVolatile);
        }
        QVERIFY(host.terminated.isEmpty());
    }

    void theProcessIsConfined()
    {
        // What the app has open and is not the picker's business.
        QFile secret(m_folder.filePath(QStringLiteral("secret")));
        QVERIFY(secret.open(QIODevice::WriteOnly));
        const int inherited = ::dup(secret.handle());
        const Surroundings surroundings(Variables{{"A_PASSWORD", "secret"}});
        ChaosHost host;
        host.present();
        QTRY_VERIFY(host.isReady());
        const pid_t service = servicesOf(getpid()).at(0);
        QCOMPARE(statusOf(service, "NoNewPrivs"), QByteArray("1"));
        QCOMPARE(statusOf(service, "Seccomp"), QByteArray("2"));
        const QDir files(QStringLiteral("/proc/%1/fd").arg(service));
        for (const auto &entry : files.entryList(QDir::AllEntries | QDir::System | QDir::NoDotAndDotDot))
            QVERIFY(QFile::symLinkTarget(files.filePath(entry)) != secret.fileName());
        QCOMPARE(QFile::symLinkTarget(files.filePath(QStringLiteral("0"))), QStringLiteral("/dev/null"));
        QFile environment(QStringLiteral("/proc/%1/environ").arg(service));
        QVERIFY(environment.open(QIODevice::ReadOnly));
        const auto variables = environment.readAll();
        QVERIFY(variables.contains("FAVRIN_DEFAULTS_FILE=") && !variables.contains("A_PASSWORD"));
        QFile limits(QStringLiteral("/proc/%1/limits").arg(service));
        QVERIFY(limits.open(QIODevice::ReadOnly));
        QVERIFY(limits.readAll().simplified().contains("Max core file size 1 1 bytes"));
        ::close(inherited);
    }

private:
    Settings m_settings;
    QTemporaryDir m_folder;
};

QTEST_MAIN(SurroundingsTest)
#include "tst_surroundings.moc"
