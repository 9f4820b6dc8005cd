#pragma once

#include <sys/types.h>

#include <chrono>
#include <filesystem>
#include <optional>
#include <vector>

namespace favrin::platform {

/** Which file on the disk, whatever its name. */
struct FileIdentity
{
    dev_t device = 0;
    ino_t inode = 0;

    bool operator==(const FileIdentity &) const = default;
};

/**
 * The file of a defaults store and its companions ("-wal", "-shm", "-journal"): what lies there before a database is
 * opened on it.
 */
namespace defaultsfile {

enum class Condition {
    Missing,
    /** A plain file of a size that we may open. */
    Plain,
    /** Something that is no database: to be set aside. */
    Damaged,
    /** Cannot be looked at, or is a device, which is not ours to rename. */
    Unavailable
};

Condition inspect(const std::filesystem::path &file);

/** The file under this name, symbolic links followed; none when there is none. */
std::optional<FileIdentity> identity(const std::filesystem::path &file);

/**
 * True when the header of the database claims a format that SQLite may only read. Call it while this process has no
 * connection to the file: closing the file here ends the locks of a connection.
 */
bool claimsReadOnlyFormat(const std::filesystem::path &file);

/** Makes an empty file for its owner alone, and its folders where they are missing, durably. */
bool create(const std::filesystem::path &file);

/** Held while the files of a store are set up or renamed, so that no two processes do that at once. */
class FolderLock
{
public:
    using Clock = std::chrono::steady_clock;

    /** Locks the folder of @p file, waiting for another process until @p deadline. */
    FolderLock(const std::filesystem::path &file, Clock::time_point deadline);
    ~FolderLock();
    FolderLock(const FolderLock &) = delete;
    FolderLock &operator=(const FolderLock &) = delete;

    explicit operator bool() const { return m_isLocked; }
    /** Makes what was renamed durable. */
    bool synchronise() const;

private:
    int m_folder = -1;
    bool m_isLocked = false;
};

/**
 * Renames @p file and its companions to a name that nobody uses. When @p damaged is given and the name already stands
 * for another file (another process was quicker), nothing is renamed. True when the name is free or stands for another
 * file afterwards.
 */
bool setAside(const std::filesystem::path &file, const std::optional<FileIdentity> &damaged,
              FolderLock::Clock::time_point deadline);

/**
 * Does in advance what a process cannot do any more once it may write in a few folders only: makes the folder, and sets
 * aside what is no file. Gives the folders in which the store writes: that of @p file, and that of what it links to.
 */
std::vector<std::filesystem::path> settle(const std::filesystem::path &file, FolderLock::Clock::time_point deadline);

} // namespace defaultsfile

} // namespace favrin::platform
