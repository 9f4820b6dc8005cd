#pragma once

#include <array>
#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace favrin::platform {

/** The names under which the platform knows its standard color spaces. They are data: they travel and are stored. */
namespace colorspacename {
inline constexpr std::string_view sRGB = "kTQColorSpaceSRGB";
inline constexpr std::string_view displayP3 = "kTQColorSpaceDisplayP3";
inline constexpr std::string_view extendedSRGB = "kTQColorSpaceExtendedSRGB";
inline constexpr std::string_view linearSRGB = "kTQColorSpaceLinearSRGB";
inline constexpr std::string_view gray = "kTQColorSpaceGray";
} // namespace colorspacename

/** Three values: red, green, blue, or what stands in their place. */
using Triple = std::array<double, 3>;

/**
 * A color space: an immutable value, cheap to copy, usable on any thread.
 *
 * A space has one color component (gray) or three (red, green, blue), encoded by its transfer curve. A
 * standard-range space holds encoded values 0…1; an extended-range space holds any finite value, its curve being odd.
 * All spaces share the white point D65; spaces with another white are adapted when they are made.
 */
class ColorSpace
{
public:
    enum class Range { Standard, Extended };

    /** What the components mean; Custom is a space of its own matrix and curve. */
    enum class Model { SRGB, DisplayP3, ExtendedSRGB, LinearSRGB, Gray, Custom };

    /** The space known under @p name (see colorspacename), or none for a name that is not known. */
    static std::optional<ColorSpace> named(std::string_view name);

    static ColorSpace sRGB();
    static ColorSpace displayP3();
    static ColorSpace extendedSRGB();
    static ColorSpace linearSRGB();
    /** One component on the sRGB curve. */
    static ColorSpace gray();

    /**
     * A space without a name, of standard range. Equal to another made from equal arguments.
     * @param toLinearSRGB row-major matrix from the space's linear components to linear sRGB (D65)
     * @param decode the transfer curve, from an encoded component to linear light; called on any thread
     */
    static ColorSpace unnamed(const std::array<Triple, 3> &toLinearSRGB,
                              double (*decode)(double encoded, double parameter), double parameter);

    /** The platform name, or none for a space that has no name. */
    std::optional<std::string> name() const;
    Model model() const;
    /** 1 for gray, otherwise 3. */
    std::size_t componentCount() const;
    Range range() const;

    /** Linear-light sRGB of the encoded components, unclipped. For gray only the first entry is read. */
    Triple toLinearSRGB(const Triple &encoded) const;

    bool operator==(const ColorSpace &other) const;

private:
    struct Definition;
    explicit ColorSpace(std::shared_ptr<const Definition> definition);
    std::shared_ptr<const Definition> m_definition;
};

} // namespace favrin::platform
