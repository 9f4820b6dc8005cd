#include "platform/defaults/userdefaults.h"

#include "platform/defaults/defaultsdatabase.h"
#include "platform/defaults/defaultslocation.h"
#include "platform/log/log.h"

#include <map>
#include <utility>

namespace favrin::platform {

namespace {

using namespace std::chrono_literals;

constexpr auto longestWait = 400ms;
constexpr std::size_t maximumKeySize = 1024;

const Log &defaultsLog()
{
    static const Log log("com.quenta.favrin.platform", "UserDefaults");
    return log;
}

using OptionalValue = std::optional<DefaultsValue>;

OptionalValue decoded(const std::optional<EncodedValue> &value)
{
    return value ? decode(value->type, value->bytes) : OptionalValue();
}

template<class Form>
std::optional<Form> as(OptionalValue value)
{
    auto *form = value ? std::get_if<Form>(&*value) : nullptr;
    return form ? std::optional<Form>(std::move(*form)) : std::nullopt;
}

} // namespace

struct UserDefaults::Private
{
    enum class Access { Read, Write };

    explicit Private(const std::filesystem::path &path) : file(path) {}

    const std::filesystem::path file;
    std::unique_ptr<DefaultsDatabase> database;
    /** What could not be written so far; none stands for a removed key. */
    std::map<std::string, std::optional<EncodedValue>, std::less<>> pending;
    bool reported = false;
    bool working = false;

    Outcome perform(Access access, const std::function<Outcome(DefaultsDatabase &)> &step);
    Outcome open(Access access);
    std::optional<FileIdentity> giveUp();
    void report(const char *what);

    bool isStored(std::string_view key, const std::optional<EncodedValue> &value);
    std::optional<EncodedValue> visible(std::string_view key);
    Outcome writePending(DefaultsDatabase &target, std::string_view except);
    bool store(std::string_view key, const Change &change);
};

namespace {

/** What a change makes of a value, decided as often as a transaction has to begin anew. */
struct Decision
{
    explicit Decision(const UserDefaults::Change &apply) : change(apply) {}

    const UserDefaults::Change &change;
    std::optional<EncodedValue> next;
    bool made = false;
    bool refused = false;

    void make(const std::optional<EncodedValue> &current)
    {
        const auto changed = change(decoded(current));
        next = changed ? encode(*changed) : std::optional<EncodedValue>();
        made = true;
        refused = changed && !next;
    }
};

} // namespace

/** Makes sure of a connection to the file that has the name now; done without one when a read finds no file. */
Outcome UserDefaults::Private::open(Access access)
{
    if (database && database->identity() == defaultsfile::identity(file))
        return Outcome::Done;
    database.reset();
    switch (defaultsfile::inspect(file)) {
    case defaultsfile::Condition::Missing:
        if (access == Access::Read)
            return Outcome::Done;
        if (!defaultsfile::create(file))
            return Outcome::Unavailable;
        break;
    case defaultsfile::Condition::Plain:
        break;
    case defaultsfile::Condition::Damaged:
        return Outcome::Damaged;
    case defaultsfile::Condition::Unavailable:
        return Outcome::Unavailable;
    }
    Outcome outcome = Outcome::Done;
    database = DefaultsDatabase::open(file, outcome);
    return outcome;
}

/** Closes a database that could not be used as it was, and says which file that was. */
std::optional<FileIdentity> UserDefaults::Private::giveUp()
{
    if (!database)
        return {};
    const auto identity = database->identity();
    database->keepFilesOnClose();
    database.reset();
    return identity;
}

void UserDefaults::Private::report(const char *what)
{
    if (std::exchange(reported, true))
        return;
    const std::string reason = database ? database->reason() : "the file can be neither opened nor made";
    defaultsLog().warning("The user defaults in " + file.string() + " cannot be " + what + ": " + reason +
                          "; changes last until this process ends");
}

Outcome UserDefaults::Private::perform(Access access, const std::function<Outcome(DefaultsDatabase &)> &step)
{
    // Called from within a change: the transaction under way must not lose its connection.
    if (working)
        return Outcome::Unavailable;
    const auto deadline = DefaultsDatabase::Clock::now() + longestWait;
    std::optional<FileIdentity> suspect;
    // A file is found damaged twice before it is set aside; then there is a new one, and once more what another process
    // may have done meanwhile.
    for (int round = 0; round < 4; ++round) {
        auto outcome = open(access);
        if (outcome == Outcome::Done && database) {
            database->setDeadline(deadline);
            working = true;
            outcome = step(*database);
            working = false;
        }
        if (outcome != Outcome::Damaged && outcome != Outcome::ReadOnly)
            return outcome;
        // The next round or the next call opens the file anew: what kept it from being written may have passed.
        const auto unusable = giveUp();
        if (outcome == Outcome::ReadOnly && !defaultsfile::claimsReadOnlyFormat(file))
            break;
        // A disk that failed to give a page for a moment makes a file look damaged, too.
        if (unusable && suspect != unusable) {
            suspect = unusable;
            continue;
        }
        defaultsLog().warning("The user defaults in " + file.string() +
                              " are damaged; they are set aside and the settings start anew");
        if (!defaultsfile::setAside(file, unusable, deadline))
            break;
    }
    return Outcome::Unavailable;
}

std::optional<EncodedValue> UserDefaults::Private::visible(std::string_view key)
{
    if (const auto waiting = pending.find(key); waiting != pending.end())
        return waiting->second;
    std::optional<EncodedValue> value;
    const auto outcome = perform(Access::Read, [&](DefaultsDatabase &source) { return source.read(key, value); });
    if (outcome != Outcome::Done)
        report("read");
    return value;
}

/** True when there is nothing to write, which needs no transaction to find out. */
bool UserDefaults::Private::isStored(std::string_view key, const std::optional<EncodedValue> &value)
{
    std::optional<EncodedValue> stored;
    const auto read = [&](DefaultsDatabase &source) { return source.read(key, stored); };
    return pending.empty() && perform(Access::Read, read) == Outcome::Done && stored == value;
}

Outcome UserDefaults::Private::writePending(DefaultsDatabase &target, std::string_view except)
{
    for (const auto &[key, value] : pending) {
        if (key == except)
            continue;
        if (const auto outcome = target.write(key, value); outcome != Outcome::Done)
            return outcome;
    }
    return Outcome::Done;
}

bool UserDefaults::Private::store(std::string_view key, const Change &change)
{
    if (key.size() > maximumKeySize || working)
        return false;
    Decision decision(change);
    const auto outcome = perform(Access::Write, [&](DefaultsDatabase &target) {
        return target.transaction([&] {
            std::optional<EncodedValue> stored;
            if (const auto read = target.read(key, stored); read != Outcome::Done)
                return read;
            const auto waiting = pending.find(key);
            decision.make(waiting == pending.end() ? stored : waiting->second);
            if (decision.refused)
                return Outcome::Unavailable;
            if (const auto written = writePending(target, key); written != Outcome::Done)
                return written;
            return decision.next == stored ? Outcome::Done : target.write(key, decision.next);
        });
    });
    if (outcome == Outcome::Done) {
        pending.clear();
        reported = false;
        return true;
    }
    if (!decision.made)
        decision.make(visible(key));
    if (!decision.refused) {
        report("written");
        pending.insert_or_assign(std::string(key), decision.next);
    }
    return false;
}

UserDefaults::UserDefaults(const std::filesystem::path &file) : d(new Private(file)) {}

UserDefaults::~UserDefaults() = default;

UserDefaults &UserDefaults::standard()
{
    static UserDefaults defaults(standardDefaultsFile());
    return defaults;
}

std::optional<DefaultsValue> UserDefaults::value(std::string_view key) const
{
    return decoded(d->visible(key));
}

std::optional<Bytes> UserDefaults::bytes(std::string_view key) const
{
    return as<Bytes>(value(key));
}

std::optional<std::string> UserDefaults::string(std::string_view key) const
{
    return as<std::string>(value(key));
}

std::optional<DefaultsArray> UserDefaults::array(std::string_view key) const
{
    return as<DefaultsArray>(value(key));
}

bool UserDefaults::set(std::string_view key, const DefaultsValue &value)
{
    const auto encoded = encode(value);
    if (!encoded)
        return false;
    return d->isStored(key, encoded) || d->store(key, [&value](const OptionalValue &) { return value; });
}

bool UserDefaults::remove(std::string_view key)
{
    return d->isStored(key, {}) || d->store(key, [](const OptionalValue &) { return OptionalValue(); });
}

bool UserDefaults::update(std::string_view key, const Change &change)
{
    return d->store(key, change);
}

} // namespace favrin::platform
