#include "host/colorbridge.h"

#include <array>
#include <cmath>

namespace favrin::host {

using platform::Color;
using platform::ColorSpace;
using platform::Triple;

namespace {

/** From linear components to linear sRGB (D65); ProPhoto's white is adapted by Bradford's method. */
constexpr std::array<Triple, 3> fromLinearAdobeRGB = {{
    {1.398355743960778, -0.3983557439607783, 0.0},
    {0.0, 1.0, 0.0},
    {0.0, -0.04292898929447318, 1.042928989294473},
}};
constexpr std::array<Triple, 3> fromLinearProPhoto = {{
    {2.034367543477799, -0.7276344741733605, -0.3067330693044384},
    {-0.2288267981953874, 1.231753396226232, -0.002926598030844794},
    {-0.008558424336656528, -0.1532682035283147, 1.161826627864971},
}};
constexpr std::array<Triple, 3> fromLinearDisplayP3 = {{
    {1.2249401762805598, -0.2249401762805598, 0.0},
    {-0.0420569547096881, 1.0420569547096881, 0.0},
    {-0.0196375545903344, -0.0786360455506319, 1.0982736001409663},
}};
constexpr std::array<Triple, 3> fromLinearSRGB = {{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}};

double decodeGamma(double encoded, double gamma)
{
    return std::copysign(std::pow(std::abs(encoded), gamma), encoded);
}

double decodeSRGB(double encoded, double)
{
    const double value = std::abs(encoded);
    return std::copysign(value <= 0.04045 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4), encoded);
}

double decodeProPhoto(double encoded, double)
{
    const double value = std::abs(encoded);
    return std::copysign(value < 16.0 / 512.0 ? value / 16.0 : std::pow(value, 1.8), encoded);
}

const std::array<Triple, 3> *matrixOf(QColorSpace::Primaries primaries)
{
    switch (primaries) {
    case QColorSpace::Primaries::SRgb:
        return &fromLinearSRGB;
    case QColorSpace::Primaries::AdobeRgb:
        return &fromLinearAdobeRGB;
    case QColorSpace::Primaries::DciP3D65:
        return &fromLinearDisplayP3;
    case QColorSpace::Primaries::ProPhotoRgb:
        return &fromLinearProPhoto;
    default:
        return nullptr;
    }
}

FVColor publicColor(const Color &color, std::string_view space)
{
    const auto components = color.components();
    return FVColor(components[0], components[1], components[2], color.alpha(),
                   QString::fromUtf8(space.data(), static_cast<qsizetype>(space.size())));
}

} // namespace

std::optional<Color> toPlatformColor(const FVColor &color)
{
    if (!color.isValid())
        return std::nullopt;
    const std::array<double, 3> components = {color.red(), color.green(), color.blue()};
    return Color(ColorSpace::named(color.colorSpace().toStdString()), components, color.alpha());
}

FVColor toPublicColor(const std::optional<Color> &color)
{
    if (!color)
        return {};
    const auto &space = color->colorSpace();
    if (!space || (space->name() && space->componentCount() == 3))
        return publicColor(*color, space ? *space->name() : platform::colorspacename::sRGB);
    Triple encoded = {};
    std::copy(color->components().begin(), color->components().end(), encoded.begin());
    const Color linear(ColorSpace::linearSRGB(), space->toLinearSRGB(encoded), color->alpha());
    return publicColor(linear, platform::colorspacename::linearSRGB);
}

std::optional<ColorSpace> toPlatformColorSpace(const QColorSpace &space)
{
    if (space == QColorSpace(QColorSpace::SRgb))
        return ColorSpace::extendedSRGB();
    if (space == QColorSpace(QColorSpace::SRgbLinear))
        return ColorSpace::linearSRGB();
    if (space == QColorSpace(QColorSpace::DisplayP3))
        return ColorSpace::displayP3();
    const auto *matrix = matrixOf(space.primaries());
    if (!matrix)
        return std::nullopt;
    switch (space.transferFunction()) {
    case QColorSpace::TransferFunction::Linear:
        return ColorSpace::unnamed(*matrix, decodeGamma, 1.0);
    case QColorSpace::TransferFunction::Gamma:
        return ColorSpace::unnamed(*matrix, decodeGamma, static_cast<double>(space.gamma()));
    case QColorSpace::TransferFunction::SRgb:
        return ColorSpace::unnamed(*matrix, decodeSRGB, 0.0);
    case QColorSpace::TransferFunction::ProPhotoRgb:
        return ColorSpace::unnamed(*matrix, decodeProPhoto, 0.0);
    default:
        return std::nullopt;
    }
}

} // namespace favrin::host
