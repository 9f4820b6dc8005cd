#include "remote/wiretext.h"

#include <array>

namespace favrin::remote {

namespace {

struct Lead
{
    unsigned char first;
    unsigned char last;
    std::size_t followers;
    // The range of the second byte is what rules out overlong forms, surrogates and values above U+10FFFF.
    unsigned char secondFirst;
    unsigned char secondLast;
};

constexpr std::array<Lead, 9> leads = {{
    {0x01, 0x7f, 0, 0, 0},
    {0xc2, 0xdf, 1, 0x80, 0xbf},
    {0xe0, 0xe0, 2, 0xa0, 0xbf},
    {0xe1, 0xec, 2, 0x80, 0xbf},
    {0xed, 0xed, 2, 0x80, 0x9f},
    {0xee, 0xef, 2, 0x80, 0xbf},
    {0xf0, 0xf0, 3, 0x90, 0xbf},
    {0xf1, 0xf3, 3, 0x80, 0xbf},
    {0xf4, 0xf4, 3, 0x80, 0x8f},
}};

bool isFollower(unsigned char byte)
{
    return (byte & 0xc0) == 0x80;
}

/** Bytes of the character that @p text begins with, or 0 when it is not well-formed. */
std::size_t characterLength(std::string_view text)
{
    const auto byteAt = [text](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    for (const Lead &lead : leads) {
        if (byteAt(0) < lead.first || byteAt(0) > lead.last)
            continue;
        if (text.size() <= lead.followers)
            return 0;
        if (lead.followers > 0 && (byteAt(1) < lead.secondFirst || byteAt(1) > lead.secondLast))
            return 0;
        for (std::size_t i = 2; i <= lead.followers; ++i) {
            if (!isFollower(byteAt(i)))
                return 0;
        }
        return lead.followers + 1;
    }
    return 0;
}

} // namespace

bool isWireText(std::string_view text)
{
    while (!text.empty()) {
        const std::size_t length = characterLength(text);
        if (length == 0)
            return false;
        text.remove_prefix(length);
    }
    return true;
}

bool isWireText(std::string_view text, std::size_t limit)
{
    return text.size() <= limit && isWireText(text);
}

std::string_view cutToBytes(std::string_view text, std::size_t limit)
{
    if (text.size() <= limit)
        return text;
    while (limit > 0 && isFollower(static_cast<unsigned char>(text[limit])))
        --limit;
    return text.substr(0, limit);
}

std::optional<std::string> sendableText(std::string_view text, std::size_t limit)
{
    if (!isWireText(text))
        return std::nullopt;
    return std::string(cutToBytes(text, limit));
}

} // namespace favrin::remote
