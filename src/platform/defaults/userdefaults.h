#pragma once

#include <filesystem>
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
 * A write is on the disk when set() returns true. Writing an equal value writes nothing. A file that is damaged is set
 * aside under another name, never overwritten. When the file cannot be opened or written the store works in memory and
 * says so once in the log; set() then returns false. Main thread only. No call blocks for more than half a second.
 */
class UserDefaults
{
public:
    /** The store in @p file; its folder is made when it is missing. */
    explicit UserDefaults(const std::filesystem::path &file);
    ~UserDefaults();
    UserDefaults(const UserDefaults &) = delete;
    UserDefaults &operator=(const UserDefaults &) = delete;

    /**
     * The store of this process, in "$XDG_DATA_HOME/favrin-color-picker/defaults.sqlite" (the environment variable
     * FAVRIN_DEFAULTS_FILE names another file). Opened on first use.
     */
    static UserDefaults &standard();

    std::optional<DefaultsValue> value(std::string_view key) const;
    /** The value when it is of that form, otherwise none. */
    std::optional<Bytes> bytes(std::string_view key) const;
    std::optional<std::string> string(std::string_view key) const;
    std::optional<DefaultsArray> array(std::string_view key) const;

    /** True when the value is durably stored (or equal to what was stored already). */
    bool set(std::string_view key, const DefaultsValue &value);
    bool remove(std::string_view key);

private:
    struct Private;
    std::unique_ptr<Private> d;
};

} // namespace favrin::platform
