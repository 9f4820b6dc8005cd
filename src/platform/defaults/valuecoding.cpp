#include "platform/defaults/valuecoding.h"

namespace favrin::platform {

// An array is the row of its elements, each as one byte for its type, four for its length (lowest first), its bytes.

namespace {

enum ValueType : int { BytesType = 1, StringType = 2, ArrayType = 3 };

constexpr int maximumDepth = 16;
constexpr std::size_t headSize = 5;

bool append(Bytes &out, const DefaultsValue &value, int depth);

bool appendContent(Bytes &out, const DefaultsValue &value, int depth)
{
    if (const auto *elements = std::get_if<DefaultsArray>(&value)) {
        for (const auto &element : *elements) {
            if (!append(out, element, depth + 1))
                return false;
        }
    } else if (const auto *text = std::get_if<std::string>(&value)) {
        out.insert(out.end(), text->begin(), text->end());
    } else if (const auto *bytes = std::get_if<Bytes>(&value)) {
        out.insert(out.end(), bytes->begin(), bytes->end());
    }
    return out.size() <= maximumValueSize && depth < maximumDepth;
}

int typeOf(const DefaultsValue &value)
{
    return static_cast<int>(value.index()) + BytesType;
}

bool append(Bytes &out, const DefaultsValue &value, int depth)
{
    const std::size_t head = out.size();
    out.resize(head + headSize);
    if (!appendContent(out, value, depth))
        return false;
    const std::size_t length = out.size() - head - headSize;
    out[head] = static_cast<unsigned char>(typeOf(value));
    for (std::size_t index = 0; index < 4; ++index)
        out[head + 1 + index] = static_cast<unsigned char>(length >> (8 * index));
    return true;
}

std::optional<DefaultsValue> decodeNested(int type, std::span<const unsigned char> bytes, int depth);

std::optional<DefaultsValue> decodeArray(std::span<const unsigned char> bytes, int depth)
{
    DefaultsArray elements;
    while (!bytes.empty()) {
        if (bytes.size() < headSize)
            return {};
        std::size_t length = 0;
        for (std::size_t index = 0; index < 4; ++index)
            length |= std::size_t(bytes[1 + index]) << (8 * index);
        if (length > bytes.size() - headSize)
            return {};
        auto element = decodeNested(bytes[0], bytes.subspan(headSize, length), depth + 1);
        if (!element)
            return {};
        elements.push_back(std::move(*element));
        bytes = bytes.subspan(headSize + length);
    }
    return elements;
}

std::optional<DefaultsValue> decodeNested(int type, std::span<const unsigned char> bytes, int depth)
{
    if (depth >= maximumDepth)
        return {};
    switch (type) {
    case BytesType:
        return Bytes(bytes.begin(), bytes.end());
    case StringType:
        return std::string(bytes.begin(), bytes.end());
    case ArrayType:
        return decodeArray(bytes, depth);
    }
    return {};
}

} // namespace

std::optional<EncodedValue> encode(const DefaultsValue &value)
{
    EncodedValue encoded{typeOf(value), {}};
    if (!appendContent(encoded.bytes, value, 0))
        return {};
    return encoded;
}

std::optional<DefaultsValue> decode(int type, std::span<const unsigned char> bytes)
{
    if (bytes.size() > maximumValueSize)
        return {};
    return decodeNested(type, bytes, 0);
}

} // namespace favrin::platform
