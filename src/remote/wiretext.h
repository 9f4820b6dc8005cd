#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

/** Texts on the wire: UTF-8, of limited length. Pure functions, any thread. */
namespace favrin::remote {

/** Well-formed UTF-8: no overlong forms, no surrogates, nothing above U+10FFFF, no NUL. */
bool isWireText(std::string_view text);
/** Well-formed and at most @p limit bytes. */
bool isWireText(std::string_view text, std::size_t limit);

/** The longest beginning of at most @p limit bytes that does not cut a character. @p text must be well-formed. */
std::string_view cutToBytes(std::string_view text, std::size_t limit);

/** What may be sent of @p text: cut to @p limit bytes; nothing of a text that is not well-formed. */
std::optional<std::string> sendableText(std::string_view text, std::size_t limit);

} // namespace favrin::remote
