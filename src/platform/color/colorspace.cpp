#include "platform/color/colorspace.h"

#include "platform/color/primaries.h"
#include "platform/color/rgbconversion.h"

namespace favrin::platform {

struct ColorSpace::Definition
{
    Model model;
    std::string_view name;
    Range range = Range::Standard;
    Matrix toLinearSRGB = {};
    double (*decode)(double, double) = nullptr;
    double parameter = 0.0;
};

ColorSpace::ColorSpace(std::shared_ptr<const Definition> definition) : m_definition(std::move(definition)) {}

std::optional<ColorSpace> ColorSpace::named(std::string_view name)
{
    for (const ColorSpace &space : {sRGB(), displayP3(), extendedSRGB(), linearSRGB(), gray()}) {
        if (space.m_definition->name == name)
            return space;
    }
    return std::nullopt;
}

ColorSpace ColorSpace::sRGB()
{
    static const ColorSpace space(std::make_shared<Definition>(Definition{Model::SRGB, colorspacename::sRGB}));
    return space;
}

ColorSpace ColorSpace::displayP3()
{
    static const ColorSpace space(
        std::make_shared<Definition>(Definition{Model::DisplayP3, colorspacename::displayP3}));
    return space;
}

ColorSpace ColorSpace::extendedSRGB()
{
    static const ColorSpace space(
        std::make_shared<Definition>(Definition{Model::ExtendedSRGB, colorspacename::extendedSRGB, Range::Extended}));
    return space;
}

ColorSpace ColorSpace::linearSRGB()
{
    static const ColorSpace space(
        std::make_shared<Definition>(Definition{Model::LinearSRGB, colorspacename::linearSRGB}));
    return space;
}

ColorSpace ColorSpace::gray()
{
    static const ColorSpace space(std::make_shared<Definition>(Definition{Model::Gray, colorspacename::gray}));
    return space;
}

ColorSpace ColorSpace::unnamed(const std::array<Triple, 3> &toLinearSRGB,
                               double (*decode)(double encoded, double parameter), double parameter)
{
    return ColorSpace(
        std::make_shared<Definition>(Definition{Model::Custom, {}, Range::Standard, toLinearSRGB, decode, parameter}));
}

std::optional<std::string> ColorSpace::name() const
{
    if (m_definition->name.empty())
        return std::nullopt;
    return std::string(m_definition->name);
}

ColorSpace::Model ColorSpace::model() const
{
    return m_definition->model;
}

std::size_t ColorSpace::componentCount() const
{
    return model() == Model::Gray ? 1 : 3;
}

ColorSpace::Range ColorSpace::range() const
{
    return m_definition->range;
}

Triple ColorSpace::toLinearSRGB(const Triple &encoded) const
{
    const auto decoded = [&encoded](auto curve) {
        return Triple{curve(encoded[0]), curve(encoded[1]), curve(encoded[2])};
    };
    switch (m_definition->model) {
    case Model::SRGB:
        return decoded(decodedSRGB);
    case Model::DisplayP3:
        return linearDisplayP3ToLinearSRGB(decoded(decodedSRGB));
    case Model::ExtendedSRGB:
        return decoded(decodedExtendedSRGB);
    case Model::LinearSRGB:
        return encoded;
    case Model::Gray: {
        const double linear = decodedSRGB(encoded[0]);
        return {linear, linear, linear};
    }
    case Model::Custom:
        break;
    }
    const Definition &custom = *m_definition;
    return multiplied(custom.toLinearSRGB,
                      decoded([&custom](double value) { return custom.decode(value, custom.parameter); }));
}

bool ColorSpace::operator==(const ColorSpace &other) const
{
    if (m_definition == other.m_definition)
        return true;
    const Definition &mine = *m_definition;
    const Definition &others = *other.m_definition;
    // Spaces with a name exist once each; only custom ones can be equal without being the same.
    return mine.model == Model::Custom && others.model == Model::Custom && mine.toLinearSRGB == others.toLinearSRGB &&
           mine.decode == others.decode && mine.parameter == others.parameter;
}

} // namespace favrin::platform
