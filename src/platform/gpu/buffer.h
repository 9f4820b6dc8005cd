#pragma once

#include <cstddef>

namespace favrin::platform::gpu {

/** Bytes that a device can read while it draws. Made by a Device. */
class Buffer
{
public:
    virtual ~Buffer() = default;
    virtual std::size_t length() const = 0;
};

} // namespace favrin::platform::gpu
