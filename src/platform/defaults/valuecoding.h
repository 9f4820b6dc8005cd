#pragma once

#include "platform/defaults/userdefaults.h"

#include <span>

namespace favrin::platform {

/** A value as it lies in the store: the number of its form and its bytes. */
struct EncodedValue
{
    int type = 0;
    Bytes bytes;

    bool operator==(const EncodedValue &) const = default;
};

inline constexpr std::size_t maximumValueSize = std::size_t(4) << 20;

/** None when the value is larger than maximumValueSize or nested too deeply. */
std::optional<EncodedValue> encode(const DefaultsValue &value);

/** None for anything that encode() does not make. */
std::optional<DefaultsValue> decode(int type, std::span<const unsigned char> bytes);

} // namespace favrin::platform
