#pragma once

#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <string_view>

namespace favrin::platform::gpu {

/** A shader function of a library, with its constants fixed. */
class Function
{
public:
    virtual ~Function() = default;
    virtual std::string name() const = 0;
};

/** The compiled shader functions of a program, by name. Made by a Device. */
class Library
{
public:
    virtual ~Library() = default;
    /**
     * The function called @p name; null when the library has none.
     * @param constants the values of the function's constants, by their number; those not given keep their default
     */
    virtual std::shared_ptr<Function> makeFunction(std::string_view name,
                                                   std::span<const std::uint32_t> constants = {}) = 0;
};

} // namespace favrin::platform::gpu
