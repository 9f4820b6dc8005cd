#include "platform/defaults/userdefaults.h"

#include "cutdisk.h"
#include "sharedobject.h"

#include <QLoggingCategory>
#include <QTemporaryDir>
#include <QtTest>

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <atomic>
#include <csignal>
#include <fstream>
#include <functional>
#include <random>

using namespace favrin::platform;
using namespace Qt::StringLiterals;
namespace fs = std::filesystem;

namespace {

using OptionalValue = std::optional<DefaultsValue>;

/** A child process that runs @p work and leaves without unwinding, as a killed one would. */
template<class Work>
pid_t startChild(Work work)
{
    const pid_t child = ::fork();
    if (child == 0) {
        work();
        ::_exit(0);
    }
    return child;
}

void kill(pid_t child)
{
    ::kill(child, SIGKILL);
    ::waitpid(child, nullptr, 0);
}

bool endedWell(pid_t child)
{
    int status = -1;
    return ::waitpid(child, &status, 0) == child && WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

/** A value whose every byte belongs together: the number, then the number's low byte again and again. */
std::string numbered(int number)
{
    return std::to_string(number) + ':' + std::string(20'000, char('a' + number % 26));
}

} // namespace

/** Numbers of saves: acknowledged before the end and until it, and found after it. */
struct Saves
{
    int known = 0;
    int acknowledged = 0;
    int stored = 0;
};

using Number = SharedObject<std::atomic<int>>;

/** What several processes do to one store, and what is left when they die. */
class UserDefaultsProcessesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        QLoggingCategory::setFilterRules(u"*.UserDefaults.warning=false"_s);
        m_folder = std::make_unique<QTemporaryDir>();
        m_file = fs::path(m_folder->path().toStdString()) / "defaults.sqlite";
    }

    void killedAtAnyMomentLeavesTheOldOrTheNewValue()
    {
        // A fixed seed: the moments still differ from run to run, the spread does not.
        std::mt19937 random(1);
        Saves saves;
        for (int round = 0; round < 60 && !QTest::currentTestFailed(); ++round) {
            saveUntil(
                m_file, saves, random() % 3000, [] {}, [] {});
            // Nothing that was acknowledged is lost; at most the save in flight is there as well.
            QVERIFY(saves.stored == saves.acknowledged || saves.stored == saves.acknowledged + 1);
        }
        QCOMPARE(std::distance(fs::directory_iterator(m_file.parent_path()), fs::directory_iterator()), 1);
    }

    void aPowerCutLosesNothingThatWasAcknowledged()
    {
        CutDisk disk;
        if (!disk.isMounted())
            QSKIP("needs the rights and the programs to make and mount a disk of its own");
        std::mt19937 random(1);
        const auto file = fs::path(disk.folder().toStdString()) / "a" / "defaults.sqlite";
        Saves saves;
        bool isSet = false;
        const int asked = qEnvironmentVariableIntValue("FAVRIN_CHAOS_ROUNDS", &isSet);
        const int rounds = isSet ? asked : 8;
        for (int round = 0; round < rounds && !QTest::currentTestFailed(); ++round) {
            saveUntil(
                file, saves, random() % 5000, [&] { QVERIFY(disk.cut()); }, [&] { QVERIFY(disk.restart()); });
            // What is acknowledged while the power fails may be lost or not; what was before, may not.
            QVERIFY2(saves.stored >= saves.known, qPrintable(u"%1 of %2"_s.arg(saves.stored).arg(saves.known)));
        }
        qInfo("the power was cut %d times, after %d saves in all", rounds, saves.stored);
        for (const auto &entry : fs::directory_iterator(file.parent_path()))
            QVERIFY(entry.path().string().find("damaged") == std::string::npos);
    }

    void twoWritersLoseNothing()
    {
        constexpr int each = 200;
        std::array<pid_t, 2> writers;
        for (std::size_t index = 0; index < writers.size(); ++index) {
            writers[index] = startChild([&] {
                UserDefaults defaults(m_file);
                for (int number = 0; number < each; ++number) {
                    const bool written = defaults.update("list", [&](const OptionalValue &value) -> OptionalValue {
                        auto list = value ? std::get<DefaultsArray>(*value) : DefaultsArray();
                        list.push_back(std::to_string(index) + ' ' + std::to_string(number));
                        return list;
                    });
                    if (!written)
                        ::_exit(1);
                }
            });
        }
        for (const pid_t writer : writers)
            QVERIFY(endedWell(writer));
        const auto list = UserDefaults(m_file).array("list");
        QVERIFY(list);
        std::array<int, 2> next{};
        for (const auto &entry : *list) {
            const auto &text = std::get<std::string>(entry);
            const auto writer = std::size_t(text.front() - '0');
            QCOMPARE(QString::fromStdString(text.substr(2)).toInt(), next.at(writer)++);
        }
        QCOMPARE(next, (std::array{each, each}));
    }

    void manyProcessesMeetADamagedFileAndLoseNothing()
    {
        for (int round = 0; round < 10; ++round) {
            fs::remove_all(m_file.parent_path());
            fs::create_directories(m_file.parent_path());
            std::ofstream(m_file) << std::string(9000, 'x');
            std::vector<pid_t> writers;
            for (int index = 0; index < 4; ++index) {
                writers.push_back(startChild([&] {
                    UserDefaults defaults(m_file);
                    if (!defaults.set("key " + std::to_string(index), std::string("x")))
                        ::_exit(1);
                }));
            }
            for (const pid_t writer : writers)
                QVERIFY(endedWell(writer));
            UserDefaults defaults(m_file);
            for (std::size_t index = 0; index < writers.size(); ++index)
                QVERIFY(defaults.string("key " + std::to_string(index)) == "x");
        }
    }

    void aProcessThatStopsWhileItWritesDelaysButDoesNotBlock()
    {
        QVERIFY(UserDefaults(m_file).set("key", std::string("before")));
        const Number inside;
        const pid_t holder = startChild([&] {
            UserDefaults(m_file).update("key", [&](const OptionalValue &value) {
                inside->store(1);
                for (;;)
                    ::pause();
                return value;
            });
        });
        QVERIFY(QTest::qWaitFor([&] { return inside->load() == 1; }));
        UserDefaults defaults(m_file);
        QVERIFY(defaults.string("key") == "before");
        QVERIFY(!defaults.set("key", std::string("after")));
        QVERIFY(defaults.string("key") == "after");
        kill(holder);
        QVERIFY(UserDefaults(m_file).string("key") == "before");
        QVERIFY(defaults.set("key", std::string("after")));
        QVERIFY(UserDefaults(m_file).string("key") == "after");
    }

    void aProcessThatStopsWhileItMakesTheIndexDoesNotBlock()
    {
        QVERIFY(endedWell(startChild([&] { UserDefaults(m_file).set("key", std::string("before")); })));
        const Number inside;
        const pid_t holder = startChild([&] {
            constexpr off_t lockOfTheMaker = 128;
            const auto index = m_file.string() + "-shm";
            const int file = ::open(index.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600);
            flock lock = {};
            lock.l_type = F_WRLCK;
            lock.l_start = lockOfTheMaker;
            lock.l_len = 1;
            inside->store(::fcntl(file, F_SETLK, &lock) == 0 ? 1 : -1);
            // Far longer than anybody should wait for it.
            ::sleep(4);
        });
        QVERIFY(QTest::qWaitFor([&] { return inside->load() != 0; }));
        QCOMPARE(inside->load(), 1);
        UserDefaults defaults(m_file);
        QVERIFY(!defaults.set("key", std::string("after")));
        QVERIFY(defaults.string("key") == "after");
        kill(holder);
        QVERIFY(defaults.set("other", std::string("x")));
        QVERIFY(UserDefaults(m_file).string("key") == "after");
    }

private:
    /** A process that saves one number after the other, until @p cut and its death; @p mend comes before the look. */
    static void saveUntil(const fs::path &file, Saves &saves, useconds_t delay, const std::function<void()> &cut,
                          const std::function<void()> &mend)
    {
        const Number acknowledged;
        acknowledged->store(saves.stored);
        const int first = saves.stored + 1;
        const pid_t writer = startChild([&] {
            UserDefaults defaults(file);
            for (int number = first;; ++number) {
                if (defaults.set("key", numbered(number)))
                    acknowledged->store(number);
            }
        });
        QVERIFY(QTest::qWaitFor([&] { return acknowledged->load() >= first; }));
        ::usleep(delay);
        saves.known = acknowledged->load();
        cut();
        kill(writer);
        saves.acknowledged = acknowledged->load();
        mend();
        UserDefaults defaults(file);
        const auto text = defaults.string("key");
        QVERIFY(text);
        saves.stored = QString::fromStdString(text->substr(0, text->find(':'))).toInt();
        QVERIFY(*text == numbered(saves.stored));
        QVERIFY(defaults.set("parent", std::to_string(first)));
    }

    std::unique_ptr<QTemporaryDir> m_folder;
    fs::path m_file;
};

QTEST_APPLESS_MAIN(UserDefaultsProcessesTest)
#include "tst_userdefaults_processes.moc"
