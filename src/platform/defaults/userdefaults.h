#pragma once

#include <filesystem>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace favrin::platform {

/** A byte string as stored in the user defaults. */
using Bytes = std::vector<unsigned char>;

/** The values that a user defaults store can hold; an array holds byte strings, texts and arrays. */
struct DefaultsValue;
using DefaultsArray = std::vector<DefaultsValue>;
struct DefaultsValue : std::variant<Bytes, std::string, DefaultsArray>
{
    using variant::variant;
};

/**
 * User defaults: values by key in one small SQLite file, shared by every process of the user that opens it.
 *
 * A write is on the disk when set(), remove() or update() returns true, whatever happens to the process or the machine
 * afterwards. A file that is damaged is set aside under another name, never overwritten, and the store goes on with a
 * new one. When the file cannot be read or written, or another process holds it too long, the store works in memory and
 * says so once in the log: the call returns false, reads give the new value, and the next write tries everything again.
 *
 * The file is opened by the first call that needs it and made by the first write. Nothing is cached: a read sees what
 * other processes have written. No call waits for another process for more than half a second. Main thread only; do not
 * use a store on both sides of a fork().
 *
 * Limits: keys of 1 KiB, values of 4 MiB, arrays 16 deep; more is refused and changes nothing.
 */
class UserDefaults
{
public:
    /** The store in @p file; its folder is made when it is missing. */
    explicit UserDefaults(const std::filesystem::path &file);
    ~UserDefaults();
    UserDefaults(const UserDefaults &) = delete;
    UserDefaults &operator=(const UserDefaults &) = delete;

    /** The store of this process, in standardDefaultsFile(). */
    static UserDefaults &standard();

    std::optional<DefaultsValue> value(std::string_view key) const;
    /** The value when it is of that form, otherwise none. */
    std::optional<Bytes> bytes(std::string_view key) const;
    std::optional<std::string> string(std::string_view key) const;
    std::optional<DefaultsArray> array(std::string_view key) const;

    /** True when the value is durably stored (or equal to what was stored already: then nothing is written). */
    bool set(std::string_view key, const DefaultsValue &value);
    /** True when no value is stored under the key any more. */
    bool remove(std::string_view key);

    /** From the value stored under a key (or none) to the one to store (or none, which removes it). */
    using Change = std::function<std::optional<DefaultsValue>(const std::optional<DefaultsValue> &)>;
    /**
     * Reads, changes and writes one value while no other process can write. @p change must not use this store; it runs
     * again when the file turns out to be damaged. True when the result is durably stored.
     */
    bool update(std::string_view key, const Change &change);

private:
    struct Private;
    std::unique_ptr<Private> d;
};

} // namespace favrin::platform
