#include "platform/defaults/defaultsfile.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <chrono>
#include <string>
#include <thread>

namespace favrin::platform::defaultsfile {

namespace {

namespace fs = std::filesystem;

// Far above what the store holds; reading a larger file would take longer than any call may.
constexpr off_t maximumSize = off_t(32) << 20;

class Descriptor
{
public:
    Descriptor(const fs::path &path, int flags, mode_t mode = 0)
        : m_number(::open(path.c_str(), flags | O_CLOEXEC, mode))
    {
    }
    ~Descriptor()
    {
        if (m_number >= 0)
            ::close(m_number);
    }
    Descriptor(const Descriptor &) = delete;
    Descriptor &operator=(const Descriptor &) = delete;
    int operator*() const { return m_number; }
    explicit operator bool() const { return m_number >= 0; }

private:
    int m_number;
};

fs::path folderOf(const fs::path &file)
{
    return file.has_parent_path() ? file.parent_path() : fs::path(".");
}

fs::path withSuffix(fs::path file, const std::string &suffix)
{
    return file += suffix;
}

/** The size of a database page: a whole file has a multiple of it. */
constexpr off_t pageSize = 4096;

Condition companionCondition(const fs::path &file)
{
    struct stat status;
    if (::lstat(file.c_str(), &status) != 0)
        return errno == ENOENT ? Condition::Missing : Condition::Unavailable;
    return S_ISREG(status.st_mode) && status.st_size <= maximumSize ? Condition::Plain : Condition::Damaged;
}

bool synchroniseFolder(const fs::path &folder)
{
    const Descriptor descriptor(folder, O_RDONLY | O_DIRECTORY);
    return descriptor && ::fsync(*descriptor) == 0;
}

bool makeFolder(const fs::path &folder)
{
    const auto make = [&folder] { return ::mkdir(folder.c_str(), 0700) == 0 && synchroniseFolder(folderOf(folder)); };
    if (make() || errno == EEXIST)
        return true;
    if (errno != ENOENT || folder == folderOf(folder))
        return false;
    return makeFolder(folderOf(folder)) && (make() || errno == EEXIST);
}

bool nameIsTaken(const fs::path &file)
{
    struct stat status;
    return ::lstat(file.c_str(), &status) == 0;
}

fs::path unusedName(const fs::path &file)
{
    const auto seconds =
        std::chrono::duration_cast<std::chrono::seconds>(std::chrono::system_clock::now().time_since_epoch());
    const auto stem = withSuffix(file, ".damaged-" + std::to_string(seconds.count()));
    fs::path name = stem;
    for (int number = 2; nameIsTaken(name); ++number)
        name = withSuffix(stem, "-" + std::to_string(number));
    return name;
}

} // namespace

Condition inspect(const fs::path &file)
{
    struct stat status;
    if (::stat(file.c_str(), &status) != 0) {
        if (errno == ELOOP)
            return Condition::Damaged;
        if (errno != ENOENT)
            return Condition::Unavailable;
        // A link to nothing would let whoever made it choose where the store is written.
        return nameIsTaken(file) ? Condition::Damaged : Condition::Missing;
    }
    if (S_ISCHR(status.st_mode) || S_ISBLK(status.st_mode))
        return Condition::Unavailable;
    if (!S_ISREG(status.st_mode) || status.st_size > maximumSize)
        return Condition::Damaged;
    bool hasLog = false;
    for (const char *suffix : {"-wal", "-shm", "-journal"}) {
        const auto condition = companionCondition(withSuffix(file, suffix));
        if (condition == Condition::Damaged || condition == Condition::Unavailable)
            return condition;
        hasLog = hasLog || condition == Condition::Plain;
    }
    // SQLite would take a short file for a new one and fill a page that was cut with zeroes. With a log beside it, it
    // may have been cut by a full disk, and the log makes it whole.
    const bool isCut = status.st_size % pageSize != 0;
    return isCut && !hasLog ? Condition::Damaged : Condition::Plain;
}

std::optional<FileIdentity> identity(const fs::path &file)
{
    struct stat status;
    if (::stat(file.c_str(), &status) != 0)
        return {};
    return FileIdentity{status.st_dev, status.st_ino};
}

bool claimsReadOnlyFormat(const fs::path &file)
{
    // Two bytes for the formats of writing and reading: 1 with a rollback journal, 2 with a write-ahead log.
    constexpr off_t formatOffset = 18;
    std::array<unsigned char, 2> formats = {};
    const Descriptor descriptor(file, O_RDONLY | O_NONBLOCK);
    return descriptor && ::pread(*descriptor, formats.data(), formats.size(), formatOffset) == 2 && formats[0] > 2;
}

bool create(const fs::path &file)
{
    if (!makeFolder(folderOf(file)))
        return false;
    {
        const Descriptor descriptor(file, O_RDWR | O_CREAT | O_EXCL | O_NOFOLLOW, 0600);
        if (!descriptor)
            return errno == EEXIST;
    }
    return synchroniseFolder(folderOf(file));
}

FolderLock::FolderLock(const fs::path &file, Clock::time_point deadline)
    : m_folder(::open(folderOf(file).c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC))
{
    while (m_folder >= 0 && !m_isLocked) {
        m_isLocked = ::flock(m_folder, LOCK_EX | LOCK_NB) == 0;
        if (m_isLocked || (errno != EWOULDBLOCK && errno != EINTR) || Clock::now() >= deadline)
            return;
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
    }
}

FolderLock::~FolderLock()
{
    if (m_folder >= 0)
        ::close(m_folder);
}

bool FolderLock::synchronise() const
{
    return ::fsync(m_folder) == 0;
}

bool setAside(const fs::path &file, const std::optional<FileIdentity> &damaged, FolderLock::Clock::time_point deadline)
{
    const FolderLock lock(file, deadline);
    if (!lock)
        return false;
    if (damaged ? identity(file) != damaged : inspect(file) != Condition::Damaged)
        return true;
    const auto aside = unusedName(file);
    // The companions first: a new store could begin to use their names as soon as the file itself is gone.
    for (const char *suffix : {"-wal", "-shm", "-journal", ""}) {
        if (::rename(withSuffix(file, suffix).c_str(), withSuffix(aside, suffix).c_str()) != 0 && errno != ENOENT)
            return false;
    }
    return lock.synchronise();
}

std::vector<fs::path> settle(const fs::path &file, FolderLock::Clock::time_point deadline)
{
    if (file.empty())
        return {};
    makeFolder(folderOf(file));
    if (inspect(file) == Condition::Damaged)
        setAside(file, {}, deadline);
    std::vector<fs::path> folders = {folderOf(file)};
    std::error_code error;
    if (fs::is_symlink(file, error))
        folders.push_back(folderOf(fs::weakly_canonical(file, error)));
    if (fs::is_regular_file(file, error))
        ::chmod(file.c_str(), 0600);
    return folders;
}

} // namespace favrin::platform::defaultsfile
