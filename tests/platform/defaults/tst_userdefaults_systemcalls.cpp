#include "platform/defaults/userdefaults.h"

#include "tracedprocess.h"

#include <QLoggingCategory>
#include <QTemporaryDir>
#include <QtTest>

#include <array>
#include <cerrno>
#include <fstream>

using namespace favrin::platform;
namespace fs = std::filesystem;
using End = TracedProcess::End;
using Kind = Fault::Kind;

namespace {

const std::string before = "before";
const std::string after(9000, 'a');

struct Report : TracedProcess::Shared
{
    /** The store said that the value is on the disk. */
    std::atomic<bool> isWritten = false;
    std::atomic<bool> isShown = false;
    std::atomic<bool> isOnDisk = false;
    std::atomic<bool> isWrittenLater = false;
};

bool holds(const fs::path &file, const std::string &text)
{
    return UserDefaults(file).string("key") == text;
}

/** Saves, watched, and then looks what became of it, and saves once more when everything works again. */
void save(UserDefaults &defaults, const fs::path &file, Report &report)
{
    report.isWatched = true;
    report.isWritten = defaults.set("key", after);
    report.isWatched = false;
    report.isShown = defaults.string("key") == after;
    report.isOnDisk = holds(file, after);
    report.isWrittenLater = defaults.set("other", std::string("x"));
}

void saveAnew(const fs::path &file, Report &report)
{
    UserDefaults defaults(file);
    save(defaults, file, report);
}

void saveAgain(const fs::path &file, Report &report)
{
    UserDefaults defaults(file);
    defaults.set("another", before);
    save(defaults, file, report);
}

/** The last one who closes a store copies its log into its file. */
void close(const fs::path &file, Report &report)
{
    {
        UserDefaults defaults(file);
        report.isWritten = defaults.set("key", after);
        report.isWatched = true;
    }
    report.isWatched = false;
    report.isShown = true;
    report.isOnDisk = holds(file, after);
    report.isWrittenLater = UserDefaults(file).set("other", std::string("x"));
}

using Prepare = void (*)(const fs::path &);
using Work = void (*)(const fs::path &, Report &);

void prepareNothing(const fs::path &) {}

void prepareStore(const fs::path &file)
{
    UserDefaults(file).set("key", before);
}

/** A process that was killed leaves its log. */
void prepareLog(const fs::path &file)
{
    if (const pid_t child = ::fork(); child == 0) {
        UserDefaults defaults(file);
        defaults.set("key", before);
        ::_exit(0);
    } else {
        ::waitpid(child, nullptr, 0);
    }
}

void prepareGarbage(const fs::path &file)
{
    fs::create_directories(file.parent_path());
    std::ofstream(file) << before << std::string(8000, 'x');
}

} // namespace

Q_DECLARE_METATYPE(Prepare)
Q_DECLARE_METATYPE(Work)

/** A save that is interrupted at each of its system calls: by death, and by each error that a disk may give. */
class UserDefaultsSystemCallsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QLoggingCategory::setFilterRules(QStringLiteral("*.UserDefaults.warning=false"));
        if (!TracedProcess::isSupported())
            QSKIP("the system calls of this architecture are not known to the test");
        const SharedObject<Report> report;
        if (TracedProcess().run(*report, {}, [] {}) == End::Refused)
            QSKIP("needs the right to trace its own children");
    }

    void death_data() { places(); }
    void death()
    {
        const int calls = count();
        for (int call = 0; call < calls && !QTest::currentTestFailed(); ++call)
            check({Kind::Kill, call, 0});
        qInfo("killed at each of %d system calls", calls);
    }

    void errors_data() { places(); }
    void errors()
    {
        // A sample; "FAVRIN_CHAOS_ROUNDS" in the environment asks for each error of each call.
        constexpr std::array errors = {ENOSPC, EIO, EROFS, EMFILE, EINTR, EACCES, EDQUOT};
        const bool isLong = qEnvironmentVariableIsSet("FAVRIN_CHAOS_ROUNDS");
        const std::size_t each = isLong ? errors.size() : 1;
        const int stride = isLong ? 1 : 3;
        int failures = 0;
        const int calls = count();
        for (int call = 0; call < calls; call += stride) {
            for (std::size_t number = 0; number < each && !QTest::currentTestFailed(); ++number) {
                const int error = errors[(std::size_t(call) + number) % errors.size()];
                check({Kind::FailOnce, call, error});
                ++failures;
                // What is interrupted may be tried for ever.
                if (error == EINTR)
                    continue;
                check({Kind::FailFromThenOn, call, error});
                ++failures;
            }
        }
        qInfo("%d failures of %d system calls", failures, calls);
    }

private:
    static void places()
    {
        QTest::addColumn<Prepare>("prepare");
        QTest::addColumn<Work>("work");
        QTest::newRow("the first save of all") << Prepare(prepareNothing) << Work(saveAnew);
        QTest::newRow("the first save of a process") << Prepare(prepareStore) << Work(saveAnew);
        QTest::newRow("a further save") << Prepare(prepareStore) << Work(saveAgain);
        QTest::newRow("beside the log of one that died") << Prepare(prepareLog) << Work(saveAnew);
        QTest::newRow("in the place of garbage") << Prepare(prepareGarbage) << Work(saveAnew);
        QTest::newRow("the end of a process") << Prepare(prepareStore) << Work(close);
    }

    End runOnce(const Fault &fault, Report &report)
    {
        QFETCH(Prepare, prepare);
        QFETCH(Work, work);
        // In memory where there is such a folder: what a power cut leaves is no matter of this test.
        m_folder = std::make_unique<QTemporaryDir>(QStringLiteral("/dev/shm/favrin-test-XXXXXX"));
        if (!m_folder->isValid())
            m_folder = std::make_unique<QTemporaryDir>();
        m_file = fs::path(m_folder->path().toStdString()) / "a" / "defaults.sqlite";
        prepare(m_file);
        return m_process.run(report, fault, [&] { work(m_file, report); });
    }

    int count()
    {
        const SharedObject<Report> report;
        return runOnce({}, *report) == End::Done ? m_process.calls() : 0;
    }

    void check(const Fault &fault)
    {
        QFETCH(Prepare, prepare);
        const SharedObject<Report> report;
        const End end = runOnce(fault, *report);
        const auto what = QStringLiteral("call %1, error %2, kind %3")
                              .arg(fault.call)
                              .arg(fault.error)
                              .arg(int(fault.kind))
                              .toLatin1();
        QVERIFY2(end == (fault.kind == Kind::Kill ? End::Killed : End::Done), what.constData());
        if (end == End::Done) {
            QVERIFY2(report->isShown, what.constData());
            QVERIFY2(report->isOnDisk || !report->isWritten, what.constData());
            QVERIFY2(report->isWrittenLater, what.constData());
        }
        {
            UserDefaults defaults(m_file);
            const bool isOld = prepare == prepareNothing || prepare == prepareGarbage
                                   ? !defaults.value("key")
                                   : defaults.string("key") == before;
            const bool isNew = defaults.string("key") == after;
            QVERIFY2(isNew || (isOld && end == End::Killed && !report->isWritten), what.constData());
            // Who died holds nobody up.
            QVERIFY2(defaults.set("key", std::string("next")), what.constData());
        }
        QVERIFY2(holds(m_file, "next"), what.constData());
        checkLeftovers(prepare == prepareGarbage, what);
    }

    /** Only the file stays, and garbage that was set aside, whole. */
    void checkLeftovers(bool wasGarbage, const QByteArray &what) const
    {
        std::vector<fs::path> others;
        for (const auto &entry : fs::directory_iterator(m_file.parent_path())) {
            if (entry.path() != m_file)
                others.push_back(entry.path());
        }
        QVERIFY2(others.size() == (wasGarbage ? 1U : 0U), what.constData());
        for (const auto &other : others)
            QVERIFY2(fs::file_size(other) == before.size() + 8000, what.constData());
    }

    TracedProcess m_process;
    std::unique_ptr<QTemporaryDir> m_folder;
    fs::path m_file;
};

QTEST_APPLESS_MAIN(UserDefaultsSystemCallsTest)
#include "tst_userdefaults_systemcalls.moc"
