#include "platform/defaults/defaultslocation.h"
#include "platform/defaults/userdefaults.h"

#include "../../shared/table.h"

#include <QDir>
#include <QLoggingCategory>
#include <QTemporaryDir>
#include <QtTest>

#include <sqlite3.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <csignal>
#include <fstream>

using namespace favrin::platform;
using namespace Qt::StringLiterals;
namespace fs = std::filesystem;

namespace {

using OptionalValue = std::optional<DefaultsValue>;
using Prepare = std::function<void(const fs::path &)>;

QByteArray contentOf(const fs::path &path)
{
    QFile file(QString::fromStdString(path.string()));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

void writeContent(const fs::path &path, const QByteArray &content)
{
    std::ofstream(path, std::ios::binary).write(content.constData(), content.size());
}

void runSql(const fs::path &path, const char *sql)
{
    sqlite3 *database = nullptr;
    QCOMPARE(sqlite3_open(path.c_str(), &database), SQLITE_OK);
    QCOMPARE(sqlite3_exec(database, sql, nullptr, nullptr, nullptr), SQLITE_OK);
    sqlite3_close(database);
}

/** A store that was closed with one value in it. */
QByteArray goodFile(const fs::path &path)
{
    UserDefaults(path).set("key", std::string("before"));
    return contentOf(path);
}

QStringList setAside(const fs::path &path)
{
    const QDir folder(QString::fromStdString(path.parent_path().string()));
    return folder.entryList({u"*.damaged-*"_s}, QDir::AllEntries | QDir::System | QDir::Hidden);
}

/** What is said to a save for which there is no more than @p limit of @p resource. */
bool setWhileLimited(UserDefaults &defaults, int resource, rlim_t limit, const DefaultsValue &value)
{
    rlimit previous = {};
    bool isLimited = ::getrlimit(resource, &previous) == 0;
    const rlimit less = {limit, previous.rlim_max};
    isLimited &= ::setrlimit(resource, &less) == 0;
    const bool isSet = defaults.set("key", value);
    return ::setrlimit(resource, &previous) != 0 || !isLimited || isSet;
}

/** A value as a test datum: the recursive variant itself has no metatype. */
struct Sample
{
    DefaultsValue value;
};

Sample nested(int depth)
{
    DefaultsValue value = std::string("leaf");
    for (int level = 0; level < depth; ++level)
        value = DefaultsArray{value};
    return {value};
}

} // namespace

/** What the store keeps, and what becomes of it when the file is not as it should be. */
class UserDefaultsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        QLoggingCategory::setFilterRules(u"*.UserDefaults.warning=false"_s);
        m_folder = std::make_unique<QTemporaryDir>();
        m_file = fs::path(m_folder->path().toStdString()) / "a" / "b" / "defaults.sqlite";
    }

    void valuesComeBackFromTheDisk_data()
    {
        addRows<Sample>({
            {"bytes", {DefaultsValue(Bytes{0, 255, 0})}},
            {"no bytes", {DefaultsValue(Bytes{})}},
            {"text", {DefaultsValue(std::string("Grid \xC3\xA9\0 end", 11))}},
            {"no text", {DefaultsValue(std::string())}},
            {"array", {DefaultsValue(DefaultsArray{Bytes{1}, std::string("x"), DefaultsArray{Bytes{}}})}},
            {"empty array", {DefaultsValue(DefaultsArray{})}},
            {"deep", nested(15)},
            {"large", {DefaultsValue(Bytes(4 << 20, 7))}},
        });
    }
    void valuesComeBackFromTheDisk()
    {
        const auto [sample] = row<Sample>();
        const auto &value = sample.value;
        QVERIFY(UserDefaults(m_file).set("key", value));
        UserDefaults defaults(m_file);
        QVERIFY(defaults.value("key") == value);
        QCOMPARE(defaults.bytes("key").has_value(), std::holds_alternative<Bytes>(value));
        QCOMPARE(defaults.string("key").has_value(), std::holds_alternative<std::string>(value));
        QCOMPARE(defaults.array("key").has_value(), std::holds_alternative<DefaultsArray>(value));
        QVERIFY(!defaults.value("Key"));
        QVERIFY(defaults.remove("key"));
        QVERIFY(!UserDefaults(m_file).value("key"));
    }

    void tooMuchIsRefusedAndChangesNothing_data()
    {
        addRows<QByteArray, Sample>({
            {"long key", QByteArray(1025, 'k'), {DefaultsValue(std::string("x"))}},
            {"large value", "key", {DefaultsValue(Bytes((4 << 20) + 1, 7))}},
            {"too deep", "key", nested(16)},
        });
    }
    void tooMuchIsRefusedAndChangesNothing()
    {
        const auto [key, sample] = row<QByteArray, Sample>();
        const auto &value = sample.value;
        goodFile(m_file);
        UserDefaults defaults(m_file);
        const std::string_view name(key.constData(), std::size_t(key.size()));
        QVERIFY(!defaults.set(name, value));
        QVERIFY(!defaults.update(name, [&](const OptionalValue &) { return value; }));
        QVERIFY(defaults.string("key") == "before");
        QVERIFY(defaults.set("other", std::string("works")));
    }

    void readingMakesNoFileAndWritingMakesAPrivateOne()
    {
        const mode_t previous = ::umask(0);
        const auto restore = qScopeGuard([&] { ::umask(previous); });
        UserDefaults defaults(m_file);
        QVERIFY(!defaults.value("key"));
        QVERIFY(defaults.remove("key"));
        QVERIFY(!fs::exists(m_file.parent_path()));
        QVERIFY(defaults.set("key", std::string("x")));
        for (const auto &entry : fs::directory_iterator(m_file.parent_path()))
            QCOMPARE(entry.status().permissions(), fs::perms(0600));
        QCOMPARE(fs::status(m_file.parent_path()).permissions(), fs::perms(0700));
        QCOMPARE(fs::status(m_file.parent_path().parent_path()).permissions(), fs::perms(0700));
    }

    void anEqualValueIsNotWrittenAgain()
    {
        UserDefaults defaults(m_file);
        const auto log = fs::path(m_file.string() + "-wal");
        QVERIFY(defaults.set("key", std::string("x")));
        const auto before = contentOf(log);
        QVERIFY(!before.isEmpty());
        QVERIFY(defaults.set("key", std::string("x")));
        QVERIFY(defaults.remove("never stored"));
        QVERIFY(defaults.update("key", [](const OptionalValue &value) { return value; }));
        QCOMPARE(contentOf(log), before);
        // Text and bytes of the same content differ.
        QVERIFY(defaults.set("key", Bytes{'x'}));
        QVERIFY(contentOf(log) != before);
    }

    void updateSeesTheStoredValueAndMayRemoveIt()
    {
        UserDefaults defaults(m_file);
        const auto append = [](const OptionalValue &value) -> OptionalValue {
            return (value ? std::get<std::string>(*value) : std::string()) + "+";
        };
        QVERIFY(defaults.update("key", append));
        QVERIFY(UserDefaults(m_file).update("key", append));
        QVERIFY(defaults.string("key") == "++");
        QVERIFY(defaults.update("key", [](const OptionalValue &) { return OptionalValue(); }));
        QVERIFY(!defaults.value("key"));
    }

    void aChangeThatUsesItsStoreDoesNoHarm()
    {
        UserDefaults defaults(m_file);
        QVERIFY(defaults.set("key", std::string("x")));
        QVERIFY(defaults.update("key", [&](const OptionalValue &) -> OptionalValue {
            [&] { QVERIFY(!defaults.set("other", std::string("y"))); }();
            return std::string("z");
        }));
        QVERIFY(defaults.string("key") == "z");
    }

    void aDamagedFileIsSetAsideWhole_data()
    {
        const auto content = [](const QByteArray &bytes) {
            return Prepare([bytes](const fs::path &path) { writeContent(path, bytes); });
        };
        const auto changed = [](auto change) {
            return Prepare([change](const fs::path &path) {
                auto bytes = goodFile(path);
                change(bytes);
                writeContent(path, bytes);
            });
        };
        const auto sql = [](const char *text) -> Prepare {
            return [text](const fs::path &path) { runSql(path, text); };
        };
        addRows<Prepare>({
            {"one byte", content("x")},
            {"text", content(QByteArray(5000, 'a'))},
            {"zeroes", content(QByteArray(8192, '\0'))},
            {"only the magic word", content(QByteArray("SQLite format 3\0", 16))},
            {"ini file", content("[General]\nFavoriteColors=@ByteArray([])\n")},
            {"cut in a page", changed([](QByteArray &bytes) { bytes.truncate(bytes.size() - 1); })},
            {"cut at a page", changed([](QByteArray &bytes) { bytes.truncate(4096); })},
            {"page size", changed([](QByteArray &bytes) { bytes[16] = 3; })},
            {"only readable format", changed([](QByteArray &bytes) { bytes[18] = 9; })},
            {"future format", changed([](QByteArray &bytes) { bytes[19] = 9; })},
            {"table root gone", changed([](QByteArray &bytes) { bytes.replace(4096, 4096, QByteArray(4096, 'x')); })},
            {"schema text", changed([](QByteArray &bytes) { bytes.replace("CREATE", "CR3ATE"); })},
            {"other table", sql("CREATE TABLE other(a)")},
            {"other columns", sql("CREATE TABLE defaults(a, b)")},
            {"no unique key", sql("CREATE TABLE defaults(key, type, value)")},
            {"a view", sql("CREATE TABLE t(key, type, value); CREATE VIEW defaults AS SELECT * FROM t")},
            {"refuses our rows",
             sql("CREATE TABLE defaults(key TEXT PRIMARY KEY, type INTEGER CHECK(type > 99), value BLOB)")},
            {"huge",
             [](const fs::path &path) {
                 writeContent(path, "x");
                 fs::resize_file(path, 40 << 20);
             }},
            {"folder", [](const fs::path &path) { fs::create_directory(path); }},
            {"pipe", [](const fs::path &path) { ::mkfifo(path.c_str(), 0600); }},
            {"link to nothing", [](const fs::path &path) { fs::create_symlink("nowhere", path); }},
            {"link to itself", [](const fs::path &path) { fs::create_symlink(path, path); }},
            {"pipe as its log",
             [](const fs::path &path) {
                 goodFile(path);
                 ::mkfifo((path.string() + "-wal").c_str(), 0600);
             }},
        });
    }
    void aDamagedFileIsSetAsideWhole()
    {
        const auto [prepare] = row<Prepare>();
        fs::create_directories(m_file.parent_path());
        prepare(m_file);
        const bool plain = fs::is_regular_file(fs::symlink_status(m_file));
        const auto before = plain ? contentOf(m_file) : QByteArray();
        UserDefaults defaults(m_file);
        defaults.value("key");
        QVERIFY(defaults.set("key", std::string("after")));
        QVERIFY(defaults.string("key") == "after");
        QVERIFY(UserDefaults(m_file).string("key") == "after");
        const auto aside = setAside(m_file);
        QVERIFY2(!aside.isEmpty(), "nothing was set aside");
        if (plain)
            QCOMPARE(contentOf(m_file.parent_path() / aside.front().toStdString()), before);
        QVERIFY(!fs::exists(m_file.parent_path() / "nowhere"));
    }

    void aFileCutAnywhereGivesTheValueOrNone()
    {
        const auto whole = goodFile(m_file);
        for (qsizetype length = 0; length < whole.size(); length += 521) {
            fs::remove(m_file);
            writeContent(m_file, whole.left(length));
            UserDefaults defaults(m_file);
            QVERIFY2(!defaults.value("key"), QByteArray::number(length).constData());
            QVERIFY2(defaults.set("key", std::string("after")), QByteArray::number(length).constData());
            QCOMPARE(setAside(m_file).isEmpty(), length == 0);
            for (const auto &name : setAside(m_file))
                fs::remove(m_file.parent_path() / name.toStdString());
        }
    }

    void aFileWithOneWrongByteIsStillServed()
    {
        const auto whole = goodFile(m_file);
        for (qsizetype offset = 0; offset < whole.size(); offset += offset < 128 ? 7 : 601) {
            fs::remove(m_file);
            auto content = whole;
            content[offset] = char(content[offset] ^ 0xA5);
            writeContent(m_file, content);
            UserDefaults defaults(m_file);
            defaults.value("key");
            QVERIFY2(defaults.set("key", std::string("after")), QByteArray::number(offset).constData());
            QVERIFY2(UserDefaults(m_file).string("key") == "after", QByteArray::number(offset).constData());
        }
    }

    void rowsThatAreNotOursReadAsNone_data()
    {
        addRows<QByteArray>({
            {"unknown type", "UPDATE defaults SET type = 4"},
            {"type as text", "UPDATE defaults SET type = 'two'"},
            {"array cut short", "UPDATE defaults SET type = 3, value = x'01020000'"},
            {"array too long", "UPDATE defaults SET type = 3, value = x'01ffffffff00'"},
            {"unknown element", "UPDATE defaults SET type = 3, value = x'0900000000'"},
            {"larger than any value", "UPDATE defaults SET value = zeroblob(9000000)"},
        });
    }
    void rowsThatAreNotOursReadAsNone()
    {
        const auto [sql] = row<QByteArray>();
        goodFile(m_file);
        runSql(m_file, sql.constData());
        UserDefaults defaults(m_file);
        QVERIFY(!defaults.value("key"));
        QVERIFY(defaults.set("key", std::string("after")));
        QVERIFY(UserDefaults(m_file).string("key") == "after");
        QVERIFY(setAside(m_file).isEmpty());
    }

    void aForeignTriggerDoesNotRun()
    {
        goodFile(m_file);
        runSql(m_file, "CREATE TRIGGER evil AFTER UPDATE ON defaults BEGIN DELETE FROM defaults; END");
        QVERIFY(UserDefaults(m_file).set("key", std::string("after")));
        QVERIFY(UserDefaults(m_file).string("key") == "after");
    }

    void worksInMemoryWhileThereIsNoFolderAndCatchesUp()
    {
        const auto obstacle = m_file.parent_path().parent_path();
        writeContent(obstacle, "a file where the folder should be");
        UserDefaults defaults(m_file);
        QLoggingCategory::setFilterRules(QString());
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(u"user defaults"_s));
        QTest::failOnWarning(QRegularExpression(u".*"_s));
        QVERIFY(!defaults.set("first", std::string("1")));
        QVERIFY(!defaults.set("first", std::string("2")));
        QVERIFY(!defaults.update("first", [](const OptionalValue &value) -> OptionalValue {
            return value ? std::get<std::string>(*value) + "+" : std::string("lost");
        }));
        QVERIFY(defaults.string("first") == "2+");
        fs::remove(obstacle);
        QVERIFY(defaults.set("second", std::string("x")));
        QVERIFY(UserDefaults(m_file).string("first") == "2+");
    }

    void aFullDiskIsReportedAndKeepsTheOldValue()
    {
        goodFile(m_file);
        UserDefaults defaults(m_file);
        QVERIFY(defaults.string("key") == "before");
        const auto handler = std::signal(SIGXFSZ, SIG_IGN);
        QVERIFY(!setWhileLimited(defaults, RLIMIT_FSIZE, 9000, Bytes(100'000, 1)));
        std::signal(SIGXFSZ, handler);
        QVERIFY(defaults.bytes("key") == Bytes(100'000, 1));
        QVERIFY(UserDefaults(m_file).string("key") == "before");
        QVERIFY(defaults.set("other", std::string("x")));
        QVERIFY(UserDefaults(m_file).bytes("key") == Bytes(100'000, 1));
    }

    void aShortageOfDescriptorsPassesWithoutLoss_data()
    {
        addRows<int>({
            {"none", 0},
            {"for the file", 1},
            {"for its log as well", 2},
        });
    }
    void aShortageOfDescriptorsPassesWithoutLoss()
    {
        const auto [available] = row<int>();
        goodFile(m_file);
        UserDefaults defaults(m_file);
        const int next = ::dup(0);
        ::close(next);
        QVERIFY(!setWhileLimited(defaults, RLIMIT_NOFILE, rlim_t(next + available), std::string("after")));
        QVERIFY(UserDefaults(m_file).string("key") == "before");
        QVERIFY(defaults.set("other", std::string("x")));
        QVERIFY(UserDefaults(m_file).string("key") == "after");
        QVERIFY(setAside(m_file).isEmpty());
    }

    void aFileTakenAwayIsNotWrittenInto()
    {
        UserDefaults defaults(m_file);
        QVERIFY(defaults.set("key", std::string("x")));
        fs::remove_all(m_file.parent_path());
        QVERIFY(!defaults.value("key"));
        QVERIFY(defaults.set("key", std::string("x")));
        QVERIFY(UserDefaults(m_file).string("key") == "x");
    }

    void standardFile_data()
    {
        const QByteArray name = "/favrin-color-picker/defaults.sqlite";
        addRows<QByteArray, QByteArray, QByteArray, QByteArray>({
            {"named", "/x/y.db", "/data", "/home/u", "/x/y.db"},
            {"data home", {}, "/data", "/home/u", "/data" + name},
            {"relative data home", {}, "data", "/home/u", "/home/u/.local/share" + name},
            {"home", {}, {}, "/home/u", "/home/u/.local/share" + name},
            {"nothing", {}, {}, {}, {}},
        });
    }
    void standardFile()
    {
        const auto [named, dataHome, home, expected] = row<QByteArray, QByteArray, QByteArray, QByteArray>();
        const std::array<const char *, 3> names{"FAVRIN_DEFAULTS_FILE", "XDG_DATA_HOME", "HOME"};
        const std::array<QByteArray, 3> previous{qgetenv(names[0]), qgetenv(names[1]), qgetenv(names[2])};
        const std::array<QByteArray, 3> values{named, dataHome, home};
        for (std::size_t index = 0; index < names.size(); ++index)
            values[index].isEmpty() ? qunsetenv(names[index]) : qputenv(names[index], values[index]);
        const auto file = standardDefaultsFile();
        for (std::size_t index = 0; index < names.size(); ++index)
            previous[index].isEmpty() ? qunsetenv(names[index]) : qputenv(names[index], previous[index]);
        QCOMPARE(QByteArray::fromStdString(file.string()), expected);
    }

    void withoutAnyFileTheStoreWorksInMemory()
    {
        UserDefaults defaults{fs::path()};
        QVERIFY(!defaults.set("key", std::string("x")));
        QVERIFY(defaults.string("key") == "x");
        QVERIFY(!defaults.remove("key"));
        QVERIFY(!defaults.value("key"));
    }

private:
    std::unique_ptr<QTemporaryDir> m_folder;
    fs::path m_file;
};

QTEST_APPLESS_MAIN(UserDefaultsTest)
#include "tst_userdefaults.moc"
