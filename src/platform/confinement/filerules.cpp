#include "platform/confinement/filerules.h"

#include "platform/confinement/confinement.h"

#include <array>
#include <cerrno>
#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include <fcntl.h>
#include <linux/landlock.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace favrin::platform {

namespace {

// What kernels after the headers of the build have learned, by the version of the interface that brought it.
constexpr std::uint64_t truncateRight = std::uint64_t(1) << 14;
constexpr int truncateVersion = 3;
constexpr std::uint64_t allTcpRights = 3;
constexpr int tcpVersion = 4;
constexpr std::uint64_t signalScope = std::uint64_t(1) << 1;
constexpr int signalVersion = 6;
constexpr int referVersion = 2;

/** The kernel takes a shorter structure than it knows, and a longer one whose rest is zero. */
struct RulesetAttributes
{
    std::uint64_t handledFileRights = 0;
    std::uint64_t handledNetworkRights = 0;
    std::uint64_t scopes = 0;
};

// No links: who could make one here could choose what the process that starts next may write.
constexpr std::uint64_t makeAndRemove = LANDLOCK_ACCESS_FS_REMOVE_DIR | LANDLOCK_ACCESS_FS_REMOVE_FILE |
                                        LANDLOCK_ACCESS_FS_MAKE_DIR | LANDLOCK_ACCESS_FS_MAKE_REG;
constexpr std::uint64_t makeOtherKinds = LANDLOCK_ACCESS_FS_MAKE_SOCK | LANDLOCK_ACCESS_FS_MAKE_FIFO |
                                         LANDLOCK_ACCESS_FS_MAKE_SYM | LANDLOCK_ACCESS_FS_MAKE_CHAR |
                                         LANDLOCK_ACCESS_FS_MAKE_BLOCK;

class Ruleset
{
public:
    explicit Ruleset(int version)
    {
        RulesetAttributes attributes;
        m_rights = LANDLOCK_ACCESS_FS_WRITE_FILE | makeAndRemove | makeOtherKinds;
        if (version >= referVersion)
            m_rights |= LANDLOCK_ACCESS_FS_REFER;
        if (version >= truncateVersion)
            m_rights |= truncateRight;
        attributes.handledFileRights = m_rights;
        attributes.handledNetworkRights = version >= tcpVersion ? allTcpRights : 0;
        attributes.scopes = version >= signalVersion ? signalScope : 0;
        m_descriptor = static_cast<int>(::syscall(SYS_landlock_create_ruleset, &attributes, sizeof attributes, 0));
    }
    ~Ruleset()
    {
        if (m_descriptor >= 0)
            ::close(m_descriptor);
    }
    Ruleset(const Ruleset &) = delete;
    Ruleset &operator=(const Ruleset &) = delete;

    bool isValid() const { return m_descriptor >= 0; }

    /** Nothing is allowed below a path that cannot be opened. */
    void allow(const std::filesystem::path &path, std::uint64_t rights) const
    {
        landlock_path_beneath_attr rule = {};
        rule.allowed_access = rights & m_rights;
        rule.parent_fd = ::open(path.c_str(), O_PATH | O_CLOEXEC);
        if (rule.parent_fd < 0)
            return;
        ::syscall(SYS_landlock_add_rule, m_descriptor, LANDLOCK_RULE_PATH_BENEATH, &rule, 0);
        ::close(rule.parent_fd);
    }

    bool enforce() const { return ::syscall(SYS_landlock_restrict_self, m_descriptor, 0) == 0; }

private:
    std::uint64_t m_rights = 0;
    int m_descriptor = -1;
};

/** Sanitizers write what they find into this folder; outside builds with them there is no such thing. */
void allowReports([[maybe_unused]] const Ruleset &rules)
{
#ifdef FAVRIN_SANITIZED
    if (const char *folder = std::getenv("FAVRIN_SANITIZER_REPORTS"))
        rules.allow(folder, LANDLOCK_ACCESS_FS_WRITE_FILE | truncateRight | LANDLOCK_ACCESS_FS_MAKE_REG);
#endif
}

} // namespace

int applyFileRules(const Confinement &confinement)
{
    const long version = ::syscall(SYS_landlock_create_ruleset, nullptr, 0, LANDLOCK_CREATE_RULESET_VERSION);
    if (version < 0)
        return errno;
    const Ruleset rules(static_cast<int>(version));
    if (!rules.isValid())
        return errno;
    constexpr std::uint64_t writing = LANDLOCK_ACCESS_FS_WRITE_FILE | truncateRight;
    for (const auto &folder : confinement.writableFolders)
        rules.allow(folder, writing | makeAndRemove | LANDLOCK_ACCESS_FS_REFER);
    // The kernel refuses rights on a file that only folders have, and these are of both kinds.
    for (const auto &device : confinement.writableDevices)
        rules.allow(device, writing);
    allowReports(rules);
    return rules.enforce() ? 0 : errno;
}

} // namespace favrin::platform
