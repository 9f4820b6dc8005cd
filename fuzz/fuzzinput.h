#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <span>
#include <string>
#include <string_view>

/** Takes an input apart, front to back; past its end everything is zero or empty. */
class FuzzInput
{
public:
    FuzzInput(const std::uint8_t *data, std::size_t size) : m_rest(data, size) {}

    bool isEmpty() const { return m_rest.empty(); }

    template<class Number>
    Number number()
    {
        Number value = {};
        const auto bytes = take(sizeof value);
        if (!bytes.empty())
            std::memcpy(&value, bytes.data(), bytes.size());
        return value;
    }

    /** At most @p size bytes. */
    std::span<const std::uint8_t> take(std::size_t size)
    {
        const auto taken = m_rest.first(std::min(size, m_rest.size()));
        m_rest = m_rest.subspan(taken.size());
        return taken;
    }

    /** A run of bytes that says its own length, in one byte (in units of @p unit). */
    std::span<const std::uint8_t> run(std::size_t unit = 1) { return take(number<std::uint8_t>() * unit); }
    std::string text(std::size_t unit = 1)
    {
        const auto bytes = run(unit);
        return {bytes.begin(), bytes.end()};
    }
    std::string rest()
    {
        const auto bytes = take(m_rest.size());
        return {bytes.begin(), bytes.end()};
    }

private:
    std::span<const std::uint8_t> m_rest;
};

/** Ends the run with this input as a finding. */
inline void require(bool holds, const char *what)
{
    if (holds)
        return;
    std::fprintf(stderr, "fuzz: does not hold: %s\n", what);
    std::abort();
}

/** Bytes as UTF-16 units, in the order of this machine. */
inline std::u16string utf16(std::span<const std::uint8_t> bytes)
{
    std::u16string text(bytes.size() / 2, u'\0');
    if (!text.empty())
        std::memcpy(text.data(), bytes.data(), text.size() * 2);
    return text;
}

/** ASCII as UTF-16, so that a corpus can be read and written by people. */
inline std::u16string widened(std::string_view bytes)
{
    std::u16string text;
    for (const char byte : bytes)
        text.push_back(static_cast<unsigned char>(byte));
    return text;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size);
