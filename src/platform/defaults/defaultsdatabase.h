#pragma once

#include "platform/defaults/defaultsfile.h"
#include "platform/defaults/valuecoding.h"

#include <chrono>
#include <filesystem>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

struct sqlite3;
struct sqlite3_stmt;

namespace favrin::platform {

/** How a step on the database ended. */
enum class Outcome {
    Done,
    /** The file is no database of ours, or its content is broken. */
    Damaged,
    /** The file was opened for reading only, by right, by a passing fault or by what its header says. */
    ReadOnly,
    /** Nothing could be done now: no right, no space, a failing disk, another process at work for too long. */
    Unavailable
};

/** One SQLite connection to the table of a defaults store. */
class DefaultsDatabase
{
public:
    /** Opens an existing file; @p outcome says why there is no database. */
    static std::unique_ptr<DefaultsDatabase> open(const std::filesystem::path &file, Outcome &outcome);
    ~DefaultsDatabase();
    DefaultsDatabase(const DefaultsDatabase &) = delete;
    DefaultsDatabase &operator=(const DefaultsDatabase &) = delete;

    /** The file that was opened, which may have another name by now. */
    const std::optional<FileIdentity> &identity() const { return m_identity; }

    /** Until when the following steps may wait for other processes. */
    using Clock = std::chrono::steady_clock;
    void setDeadline(Clock::time_point deadline);

    Outcome read(std::string_view key, std::optional<EncodedValue> &value);
    /** Runs @p steps while no other process can write, and makes what they wrote durable when they end as Done. */
    Outcome transaction(const std::function<Outcome()> &steps);
    /** Within a transaction: stores the value, or removes the key. */
    Outcome write(std::string_view key, const std::optional<EncodedValue> &value);

    /** What SQLite said of the last step that was not done. */
    const std::string &reason() const { return m_reason; }

    /** Leaves the file and its companions as they are when the connection closes. */
    void keepFilesOnClose();

private:
    struct Finalize
    {
        void operator()(sqlite3_stmt *statement) const;
    };
    using Statement = std::unique_ptr<sqlite3_stmt, Finalize>;

    DefaultsDatabase() = default;
    static int waitForOthers(void *self, int attempt);
    int prepare(Statement &statement, const char *sql) const;
    Outcome prepared(Statement &statement, const char *sql);
    int execute(const char *sql) const;
    Outcome lookForTables(bool &found);
    Outcome prepareToRead(bool &isNew);
    Outcome check();
    Outcome prepareToWrite();
    Outcome makeTable();
    Outcome outcome(int result);

    std::filesystem::path m_file;
    std::optional<FileIdentity> m_identity;
    sqlite3 *m_connection = nullptr;
    Clock::time_point m_deadline;
    Clock::time_point m_lastWrite;
    Statement m_select;
    Statement m_insert;
    Statement m_delete;
    bool m_readyToWrite = false;
    std::string m_reason;
};

} // namespace favrin::platform
