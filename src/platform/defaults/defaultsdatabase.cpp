#include "platform/defaults/defaultsdatabase.h"

#include "platform/defaults/boundedwait.h"

#include <sqlite3.h>
#include <sys/stat.h>

#include <cstdlib>
#include <thread>

namespace favrin::platform {

namespace {

constexpr const char *createSql = "CREATE TABLE IF NOT EXISTS defaults("
                                  "key TEXT NOT NULL PRIMARY KEY, type INTEGER NOT NULL, value BLOB NOT NULL)"
                                  " WITHOUT ROWID";
constexpr const char *selectSql = "SELECT type, value FROM defaults WHERE key = ?1";
constexpr const char *insertSql = "INSERT INTO defaults(key, type, value) VALUES(?1, ?2, ?3)"
                                  " ON CONFLICT(key) DO UPDATE SET type = ?2, value = ?3";
constexpr const char *deleteSql = "DELETE FROM defaults WHERE key = ?1";

void bindKey(sqlite3_stmt *statement, std::string_view key)
{
    sqlite3_bind_text(statement, 1, key.data(), static_cast<int>(key.size()), SQLITE_STATIC);
}

Bytes blobColumn(sqlite3_stmt *statement, int column)
{
    const auto *data = static_cast<const unsigned char *>(sqlite3_column_blob(statement, column));
    return data ? Bytes(data, data + sqlite3_column_bytes(statement, column)) : Bytes();
}

/** Runs a statement of one row at most and makes it ready for its next use. */
int stepOnce(sqlite3_stmt *statement)
{
    const int result = sqlite3_step(statement);
    sqlite3_reset(statement);
    sqlite3_clear_bindings(statement);
    return result;
}

} // namespace

void DefaultsDatabase::Finalize::operator()(sqlite3_stmt *statement) const
{
    sqlite3_finalize(statement);
}

std::unique_ptr<DefaultsDatabase> DefaultsDatabase::open(const std::filesystem::path &file, Outcome &outcome)
{
    std::unique_ptr<DefaultsDatabase> database(new DefaultsDatabase);
    database->m_file = file;
    database->m_identity = defaultsfile::identity(file);
    // Without SQLITE_OPEN_CREATE: SQLite would make the file readable for everybody.
    const int result =
        sqlite3_open_v2(file.c_str(), &database->m_connection,
                        SQLITE_OPEN_READWRITE | SQLITE_OPEN_NOMUTEX | SQLITE_OPEN_EXRESCODE, boundedwait::fileSystem());
    outcome = database->outcome(result);
    if (outcome != Outcome::Done)
        return nullptr;
    // What a foreign file may hold must not run.
    sqlite3_db_config(database->m_connection, SQLITE_DBCONFIG_DEFENSIVE, 1, nullptr);
    sqlite3_db_config(database->m_connection, SQLITE_DBCONFIG_TRUSTED_SCHEMA, 0, nullptr);
    sqlite3_db_config(database->m_connection, SQLITE_DBCONFIG_ENABLE_TRIGGER, 0, nullptr);
    sqlite3_db_config(database->m_connection, SQLITE_DBCONFIG_ENABLE_VIEW, 0, nullptr);
    sqlite3_limit(database->m_connection, SQLITE_LIMIT_LENGTH, static_cast<int>(2 * maximumValueSize));
    sqlite3_busy_handler(database->m_connection, waitForOthers, database.get());
    return database;
}

DefaultsDatabase::~DefaultsDatabase()
{
    m_select.reset();
    m_insert.reset();
    m_delete.reset();
    sqlite3_close(m_connection);
}

void DefaultsDatabase::keepFilesOnClose()
{
    sqlite3_db_config(m_connection, SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, 1, nullptr);
}

void DefaultsDatabase::setDeadline(Clock::time_point deadline)
{
    m_deadline = deadline;
    boundedwait::setDeadline(deadline);
}

int DefaultsDatabase::waitForOthers(void *self, int attempt)
{
    using namespace std::chrono_literals;
    if (Clock::now() >= static_cast<DefaultsDatabase *>(self)->m_deadline)
        return 0;
    std::this_thread::sleep_for(attempt < 100 ? 100us : 500us);
    return 1;
}

int DefaultsDatabase::prepare(Statement &statement, const char *sql) const
{
    sqlite3_stmt *prepared = nullptr;
    const int result = sqlite3_prepare_v3(m_connection, sql, -1, SQLITE_PREPARE_PERSISTENT, &prepared, nullptr);
    statement.reset(prepared);
    return result;
}

int DefaultsDatabase::execute(const char *sql) const
{
    return sqlite3_exec(m_connection, sql, nullptr, nullptr, nullptr);
}

Outcome DefaultsDatabase::outcome(int result)
{
    if (result != SQLITE_OK && result != SQLITE_ROW && result != SQLITE_DONE)
        m_reason = sqlite3_errmsg(m_connection) + (" (" + std::to_string(result) + ')');
    switch (result & 0xff) {
    case SQLITE_OK:
    case SQLITE_ROW:
    case SQLITE_DONE:
        return Outcome::Done;
    case SQLITE_CORRUPT:
    case SQLITE_NOTADB:
    case SQLITE_CONSTRAINT:
    case SQLITE_MISMATCH:
        return Outcome::Damaged;
    case SQLITE_READONLY:
        return Outcome::ReadOnly;
    default:
        return Outcome::Unavailable;
    }
}

/** Our statements are right: one that cannot be prepared means that the table is not ours. */
Outcome DefaultsDatabase::prepared(Statement &statement, const char *sql)
{
    const int result = prepare(statement, sql);
    return (result & 0xff) == SQLITE_ERROR ? Outcome::Damaged : outcome(result);
}

Outcome DefaultsDatabase::lookForTables(bool &found)
{
    Statement any;
    int result = prepare(any, "SELECT 1 FROM sqlite_schema");
    if (result == SQLITE_OK)
        result = sqlite3_step(any.get());
    found = result == SQLITE_ROW;
    return outcome(result);
}

Outcome DefaultsDatabase::prepareToRead(bool &isNew)
{
    if (m_select)
        return Outcome::Done;
    const auto first = prepared(m_select, selectSql);
    if (first != Outcome::Damaged)
        return first;
    bool hasTables = false;
    if (const auto looked = lookForTables(hasTables); looked != Outcome::Done || !hasTables) {
        isNew = looked == Outcome::Done;
        return looked;
    }
    // Once more: another process may have made the table in between.
    return prepared(m_select, selectSql);
}

Outcome DefaultsDatabase::read(std::string_view key, std::optional<EncodedValue> &value)
{
    value.reset();
    bool isNew = false;
    if (const auto ready = prepareToRead(isNew); ready != Outcome::Done || isNew)
        return ready;
    bindKey(m_select.get(), key);
    const int result = sqlite3_step(m_select.get());
    if (result == SQLITE_ROW)
        value = EncodedValue{sqlite3_column_int(m_select.get(), 0), blobColumn(m_select.get(), 1)};
    sqlite3_reset(m_select.get());
    // A value larger than any of ours is no value; the next write of the key replaces it.
    return (result & 0xff) == SQLITE_TOOBIG ? Outcome::Done : outcome(result);
}

Outcome DefaultsDatabase::check()
{
    Statement statement;
    int result = prepare(statement, "PRAGMA quick_check(1)");
    if (result == SQLITE_OK)
        result = sqlite3_step(statement.get());
    if (result != SQLITE_ROW)
        return outcome(result);
    const auto *text = reinterpret_cast<const char *>(sqlite3_column_text(statement.get(), 0));
    m_reason = text ? text : "no verdict";
    if (m_reason == "ok")
        return Outcome::Done;
    // A page that could not be read says nothing about what is on it.
    constexpr std::string_view mark = "error code=";
    const auto code = m_reason.find(mark);
    const bool unreadable =
        code != std::string::npos && (std::atoi(m_reason.c_str() + code + mark.size()) & 0xff) != SQLITE_CORRUPT;
    return unreadable ? Outcome::Unavailable : Outcome::Damaged;
}

Outcome DefaultsDatabase::prepareToWrite()
{
    if (m_readyToWrite)
        return Outcome::Done;
    // Before the first write the whole file is checked, so that nothing is built on a broken one.
    if (const auto checked = check(); checked != Outcome::Done)
        return checked;
    ::chmod(m_file.c_str(), 0600);
    if (const int result = execute("PRAGMA synchronous=FULL"); result != SQLITE_OK)
        return outcome(result);
    if (const auto table = makeTable(); table != Outcome::Done)
        return table;
    const auto insert = prepared(m_insert, insertSql);
    const auto erase = insert == Outcome::Done ? prepared(m_delete, deleteSql) : insert;
    m_readyToWrite = erase == Outcome::Done;
    return erase;
}

Outcome DefaultsDatabase::makeTable()
{
    bool found = false;
    if (const auto looked = lookForTables(found); looked != Outcome::Done || found)
        return looked;
    // One process at a time: two that switch a new file to its write-ahead log would wait for each other.
    const defaultsfile::FolderLock lock(m_file, m_deadline);
    if (!lock)
        return Outcome::Unavailable;
    if (const auto looked = lookForTables(found); looked != Outcome::Done || found)
        return looked;
    // The file keeps the mode. Where the log cannot be had, SQLite stays with its rollback journal: slower, as safe.
    execute("PRAGMA page_size=4096; PRAGMA journal_mode=WAL");
    return outcome(execute(createSql));
}

Outcome DefaultsDatabase::transaction(const std::function<Outcome()> &steps)
{
    if (const auto ready = prepareToWrite(); ready != Outcome::Done)
        return ready;
    // SQLite's locks know no queue: a process that writes in a row leaves the others, who poll, this time to get in.
    std::this_thread::sleep_until(m_lastWrite + std::chrono::milliseconds(2));
    if (const int result = execute("BEGIN IMMEDIATE"); result != SQLITE_OK)
        return outcome(result);
    auto ended = steps();
    if (ended == Outcome::Done)
        ended = outcome(execute("COMMIT"));
    if (ended != Outcome::Done)
        execute("ROLLBACK");
    m_lastWrite = Clock::now();
    return ended;
}

Outcome DefaultsDatabase::write(std::string_view key, const std::optional<EncodedValue> &value)
{
    if (!value) {
        bindKey(m_delete.get(), key);
        return outcome(stepOnce(m_delete.get()));
    }
    bindKey(m_insert.get(), key);
    sqlite3_bind_int(m_insert.get(), 2, value->type);
    // The pointer of an empty vector may be null, which would bind NULL.
    sqlite3_bind_blob(m_insert.get(), 3, value->bytes.empty() ? "" : static_cast<const void *>(value->bytes.data()),
                      static_cast<int>(value->bytes.size()), SQLITE_STATIC);
    return outcome(stepOnce(m_insert.get()));
}

} // namespace favrin::platform
