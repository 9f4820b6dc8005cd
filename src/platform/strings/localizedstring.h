#pragma once

#include <functional>
#include <string>
#include <string_view>

namespace favrin::platform {

/** Looks a key up in a string table; yields the key itself when the table does not hold it. UTF-8. Any thread. */
using StringTable = std::function<std::string(std::string_view key)>;

/**
 * The text for @p key in the string table "Localizable", or the key itself when there is none.
 * @param comment the note for translators; not used at run time
 * Thread-safe. Until a table is installed, every key yields itself.
 */
std::string localizedString(std::string_view key, std::string_view comment);

/**
 * Marks a key that localizedString() is given by a variable, so that tools/strings finds it with its comment. Yields
 * the key.
 */
constexpr std::string_view localizable(std::string_view key, [[maybe_unused]] std::string_view comment)
{
    return key;
}

/** Installs the table that localizedString() asks; an empty function removes it. Call on the main thread. */
void setStringTable(StringTable table);

} // namespace favrin::platform
