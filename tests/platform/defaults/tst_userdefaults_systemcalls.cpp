#include "platform/defaults/userdefaults.h"

#include "../../shared/table.h"
#include "sharedobject.h"
#include "tracedprocess.h"

#include <QLoggingCategory>
#include <QTemporaryDir>
#include <QtTest>

#include <array>
#include <cerrno>
#include <fstream>

using namespace favrin::platform;
using namespace Qt::StringLiterals;
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

/** A save that is interrupted at each of its system calls: by death, and by each error that a disk may give. */
class UserDefaultsSystemCallsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QLoggingCategory::setFilterRules(u"*.UserDefaults.warning=false"_s);
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
        const int calls = count();
        for (int call = 0; call < calls; call += stride) {
            for (std::size_t number = 0; number < each && !QTest::currentTestFailed(); ++number) {
                const int error = errors[(std::size_t(call) + number) % errors.size()];
                check({Kind::FailOnce, call, error});
                // What is interrupted may be tried for ever.
                if (error != EINTR)
                    check({Kind::FailFromThenOn, call, error});
            }
        }
        qInfo("failures of %d system calls", calls);
    }

private:
    static void places()
    {
        addRows<Prepare, Work>({
            {"the first save of all", prepareNothing, saveAnew},
            {"the first save of a process", prepareStore, saveAnew},
            {"a further save", prepareStore, saveAgain},
            {"beside the log of one that died", prepareLog, saveAnew},
            {"in the place of garbage", prepareGarbage, saveAnew},
            {"the end of a process", prepareStore, close},
        });
    }

    End runOnce(const Fault &fault, Report &report)
    {
        const auto place = row<Prepare, Work>();
        // In memory where there is such a folder: what a power cut leaves is no matter of this test.
        m_folder = std::make_unique<QTemporaryDir>(u"/dev/shm/favrin-test-XXXXXX"_s);
        if (!m_folder->isValid())
            m_folder = std::make_unique<QTemporaryDir>();
        m_file = fs::path(m_folder->path().toStdString()) / "a" / "defaults.sqlite";
        std::get<Prepare>(place)(m_file);
        return m_process.run(report, fault, [&] { std::get<Work>(place)(m_file, report); });
    }

    int count()
    {
        const SharedObject<Report> report;
        return runOnce({}, *report) == End::Done ? m_process.calls() : 0;
    }

    void check(const Fault &fault)
    {
        const auto prepare = std::get<Prepare>(row<Prepare, Work>());
        const SharedObject<Report> report;
        const End end = runOnce(fault, *report);
        const auto what =
            u"call %1, error %2, kind %3"_s.arg(fault.call).arg(fault.error).arg(int(fault.kind)).toLatin1();
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
