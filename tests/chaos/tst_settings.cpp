#include "chaoshost.h"

#include "../eyedropper/privatebus.h"

#include <functional>
#include <map>

#include <fcntl.h>
#include <sys/mount.h>
#include <sys/stat.h>

namespace {

const auto someBytes = QByteArrayLiteral("what somebody put here");

bool writeFile(const QString &path, const QByteArray &bytes, qint64 size = -1)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() && (size < 0 || file.resize(size));
}

/** A small disk of its own; needs the rights to mount one. */
class SmallDisk
{
public:
    explicit SmallDisk(QString folder) : m_folder(std::move(folder))
    {
        m_mounted = ::mount("tmpfs", path(), "tmpfs", 0, "size=256k") == 0;
    }
    ~SmallDisk()
    {
        if (m_mounted)
            ::umount2(path(), MNT_DETACH);
    }
    SmallDisk(const SmallDisk &) = delete;
    SmallDisk &operator=(const SmallDisk &) = delete;

    bool isMounted() const { return m_mounted; }
    /** Leaves this many pages free. */
    void fill(int freePages) const
    {
        QFile file(m_folder + QStringLiteral("/filler"));
        QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Unbuffered));
        while (file.write(QByteArray(4096, 'x')) == 4096) {
        }
        QVERIFY(file.resize(file.size() / 4096 * 4096 - freePages * 4096));
    }
    void makeRoom() const { QVERIFY(QFile::remove(m_folder + QStringLiteral("/filler"))); }
    bool setReadOnly(bool readOnly) const
    {
        return ::mount("tmpfs", path(), "tmpfs", MS_REMOUNT | (readOnly ? MS_RDONLY : 0), "size=256k") == 0;
    }

private:
    const char *path() const { return (m_path = QFile::encodeName(m_folder)).constData(); }

    QString m_folder;
    mutable QByteArray m_path;
    bool m_mounted = false;
};

} // namespace

/** The file of the favorites, and everything that may happen to it. */
class SettingsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup()
    {
        QTRY_VERIFY(servicesOf(getpid()).empty());
        m_settings.clear();
    }

    void whatIsNoStoreIsSetAside_data()
    {
        QTest::addColumn<bool>("isSetAside");
        for (const char *what : {"garbage", "large", "folder", "pipe", "link to nothing", "link in a circle"})
            QTest::newRow(what) << true;
        for (const char *what : {"empty", "link to a store"})
            QTest::newRow(what) << false;
    }

    void whatIsNoStoreIsSetAside()
    {
        QFETCH(bool, isSetAside);
        const auto what = QString::fromLatin1(QTest::currentDataTag());
        place(what);
        ChaosHost host;
        addOne(host);
        const auto aside = m_settings.entries().filter(QStringLiteral("damaged"));
        QCOMPARE(aside.size(), isSetAside ? 1 : 0);
        if (what == u"garbage") {
            QFile kept(m_settings.folder() + u'/' + aside[0]);
            QVERIFY(kept.open(QIODevice::ReadOnly));
            QCOMPARE(kept.readAll(), someBytes);
        }
    }

    void itMayBeReplacedWhileAPickerIsShown_data()
    {
        QTest::addColumn<QString>("by");
        for (const char *by : {"nothing", "garbage", "folder", "empty"})
            QTest::newRow(by) << QString::fromLatin1(by);
    }

    void itMayBeReplacedWhileAPickerIsShown()
    {
        QFETCH(QString, by);
        ChaosHost host;
        addOne(host);
        m_settings.clear();
        place(by);
        // The picker still knows what it shows, and the next change stores that.
        host.addFavorite(gray(101), 6);
        QTRY_COMPARE(m_settings.favorites().last(), gray(101).toQColor().name().mid(1));
        QVERIFY(host.isUnharmed());
    }

    void aFullDiskLosesNothing_data()
    {
        QTest::addColumn<int>("freePages");
        for (const int pages : {0, 1, 2, 3, 8})
            QTest::addRow("%d pages free", pages) << pages;
    }

    void aFullDiskLosesNothing()
    {
        QFETCH(int, freePages);
        const SmallDisk disk(m_settings.folder());
        if (!disk.isMounted())
            QSKIP("needs the right to mount a disk");
        {
            ChaosHost host;
            addOne(host);
            disk.fill(freePages);
            host.addFavorite(gray(101), 6);
            QVERIFY(host.picksAt(host.swatch(2, 2)));
            // The old list or the new one; both are whole.
            const auto stored = m_settings.favorites();
            QVERIFY2(stored == favoritesWith(1) || stored == favoritesWith(2), qPrintable(stored.join(u' ')));
            disk.makeRoom();
            host.addFavorite(gray(102), 7);
            QTRY_COMPARE(m_settings.favorites(), favoritesWith(3));
            QVERIFY(host.isUnharmed());
        }
        QTRY_VERIFY(servicesOf(getpid()).empty());
    }

    void aReadOnlyDiskIsNoObstacle()
    {
        const SmallDisk disk(m_settings.folder());
        if (!disk.isMounted())
            QSKIP("needs the right to mount a disk");
        {
            ChaosHost host;
            addOne(host);
            dismiss(host);
            QTRY_VERIFY(servicesOf(getpid()).empty());
            // Busy until the kernel is done with the files of the process that has just gone.
            QTRY_VERIFY(disk.setReadOnly(true));
            QVERIFY(host.present());
            host.addFavorite(gray(101), 6);
            // What cannot be stored is there all the same, as long as the picker is.
            QTRY_COMPARE(QColor(host.pixel(host.favorite(1, 2))), gray(101).toQColor());
            QVERIFY(disk.setReadOnly(false));
            host.addFavorite(gray(102), 7);
            QTRY_COMPARE(m_settings.favorites(), favoritesWith(3));
            QVERIFY(host.isUnharmed());
        }
        QTRY_VERIFY(servicesOf(getpid()).empty());
    }

    void severalPickersSaveAtOnce_data()
    {
        QTest::addColumn<int>("pickers");
        QTest::newRow("two") << 2;
        QTest::newRow("eight") << 8;
    }

    void severalPickersSaveAtOnce()
    {
        QFETCH(int, pickers);
        std::vector<ChaosHost> hosts(static_cast<std::size_t>(pickers));
        for (auto &host : hosts)
            host.picker.present(&host.window);
        for (const auto &host : hosts)
            QTRY_VERIFY_WITH_TIMEOUT(host.isReady(), 30'000);
        for (int number = 0; number < pickers; ++number)
            hosts[std::size_t(number)].addFavorite(gray(100 + number), 5);
        // Each has saved when it answers to what came after.
        for (auto &host : hosts)
            QVERIFY(host.picksAt(host.swatch(1, 1)) && host.isUnharmed());
        const auto stored = m_settings.favorites();
        QCOMPARE(stored.mid(0, 5), favoritesWith(0));
        auto added = stored.mid(5);
        QVERIFY2(!added.isEmpty() && added.size() <= pickers, qPrintable(stored.join(u' ')));
        QCOMPARE(added.removeDuplicates(), 0);
    }

    void faultsInAnyOrderLoseNothing()
    {
        constexpr unsigned seed = 20261123;
        std::mt19937 random(seed);
        const SmallDisk disk(m_settings.folder());
        PrivateBus bus;
        QVERIFY(bus.start());
        const auto address = qgetenv("DBUS_SESSION_BUS_ADDRESS");
        qputenv("DBUS_SESSION_BUS_ADDRESS", bus.address().toUtf8());
        const auto restore = qScopeGuard([&] { qputenv("DBUS_SESSION_BUS_ADDRESS", address); });
        ChaosHost host;
        int added = 0;
        const int rounds = chaosRounds(16);
        for (int round = 0; round < rounds && !QTest::currentTestFailed(); ++round) {
            if (round == rounds / 2)
                bus.stop();
            if (added > 1) {
                // The first page has room for three.
                dismiss(host);
                QTRY_VERIFY(servicesOf(getpid()).empty());
                m_settings.clear();
                added = 0;
            }
            const auto whom = static_cast<ToThePicker>(random() % 5);
            const auto what = static_cast<ToTheFile>(random() % 5);
            happen(host, whom, std::chrono::microseconds(random() % 30'000));
            happen(host, what, disk, added);
            // Whatever it was: the next favorite is kept, and all before it.
            host.addFavorite(gray(100 + added), 5 + added);
            ++added;
            const QList<int> course = {int(seed), round, int(whom), int(what)};
            QTRY_VERIFY2(m_settings.favorites() == favoritesWith(added), QTest::toString(course));
        }
        host.picker.dismiss();
    }

private:
    enum class ToThePicker { Nothing, Kill, KillInADrag, Standstill, Dismissal };
    enum class ToTheFile { Nothing, Garbage, Folder, Loss, FullDisk };

    static void dismiss(ChaosHost &host)
    {
        host.finished.clear();
        host.picker.dismiss();
        QTRY_VERIFY(host.finished.size() == 1 || !host.picker.isPresented());
    }

    /** Afterwards there is a picker, be it the same. */
    static void happen(ChaosHost &host, ToThePicker fault, std::chrono::microseconds when)
    {
        if (host.isReady() && fault == ToThePicker::Dismissal)
            dismiss(host);
        else if (host.isReady() && fault != ToThePicker::Nothing)
            sendSignal(host, fault, when);
        if (!host.picker.isPresented())
            host.picker.present(&host.window);
        QTRY_VERIFY(host.isReady());
    }

    static void sendSignal(ChaosHost &host, ToThePicker fault, std::chrono::microseconds when)
    {
        const pid_t service = servicesOf(getpid()).at(0);
        const bool ends = fault != ToThePicker::Standstill;
        if (fault == ToThePicker::KillInADrag)
            QTest::mousePress(&host.window, Qt::LeftButton, {}, host.swatch(0, 0));
        if (!ends)
            kill(service, SIGSTOP);
        {
            const SignalSoon soon(service, ends ? SIGKILL : SIGCONT, when);
            for (int step = 0; fault == ToThePicker::KillInADrag && step < 20; ++step) {
                host.dragStep(step);
                QCoreApplication::processEvents();
            }
        }
        if (ends)
            QTRY_VERIFY(!host.picker.isPresented());
        QTest::mouseRelease(&host.window, Qt::LeftButton, {}, QPoint(1, 1));
    }

    void happen(ChaosHost &host, ToTheFile fault, const SmallDisk &disk, int &added)
    {
        if (fault == ToTheFile::Nothing || (fault == ToTheFile::FullDisk && !disk.isMounted()))
            return;
        if (fault == ToTheFile::FullDisk) {
            disk.fill(0);
            host.addFavorite(gray(100 + added), 5 + added);
            ++added;
            // Taken in when it answers to what came after.
            QVERIFY(host.picksAt(host.swatch(1, 1)));
            disk.makeRoom();
            return;
        }
        m_settings.clear();
        if (fault != ToTheFile::Loss)
            place(fault == ToTheFile::Folder ? QStringLiteral("folder") : QStringLiteral("garbage"));
    }

    /** Shows a picker and keeps a first favorite. */
    void addOne(ChaosHost &host) const
    {
        QVERIFY(host.present());
        host.addFavorite(gray(100), 5);
        QTRY_COMPARE(m_settings.favorites(), favoritesWith(1));
    }

    void place(const QString &what) const
    {
        const QString file = m_settings.file();
        const QString store = m_elsewhere.filePath(QStringLiteral("store"));
        const std::map<QString, std::function<bool()>> ways = {
            {QStringLiteral("nothing"), [] { return true; }},
            {QStringLiteral("garbage"), [&] { return writeFile(file, someBytes); }},
            {QStringLiteral("empty"), [&] { return writeFile(file, {}); }},
            {QStringLiteral("large"), [&] { return writeFile(file, someBytes, 100'000'000); }},
            {QStringLiteral("folder"), [&] { return QDir().mkpath(file + QStringLiteral("/folder")); }},
            {QStringLiteral("pipe"), [&] { return ::mkfifo(QFile::encodeName(file).constData(), 0600) == 0; }},
            {QStringLiteral("link to nothing"), [&] { return QFile::link(QStringLiteral("/nowhere/at/all"), file); }},
            {QStringLiteral("link in a circle"), [&] { return QFile::link(file, file); }},
            {QStringLiteral("link to a store"), [&] { return writeFile(store, {}) && QFile::link(store, file); }},
        };
        QVERIFY(ways.at(what)());
    }

    Settings m_settings;
    QTemporaryDir m_elsewhere;
};

QTEST_MAIN(SettingsTest)
#include "tst_settings.moc"
