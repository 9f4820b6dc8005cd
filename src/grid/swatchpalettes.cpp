#include "grid/swatchpalettes.h"

#include "platform/appearance/darkcounterpart.h"

#include <algorithm>
#include <cstdint>

namespace favrin::grid {
namespace {

using model::SomeColor;

/** A gray ramp, then twelve hues by column, darkest in row 1 and lightest in row 9. RRGGBB. */
// clang-format off
constexpr std::uint32_t swatches[10][12] = {
    {0xFFFFFF, 0xEBEBEB, 0xD6D6D6, 0xC2C2C2, 0xADADAD, 0x999999, 0x858585, 0x707070, 0x5C5C5C, 0x474747, 0x333333, 0x000000},
    {0x00374A, 0x011D57, 0x11053B, 0x2E063D, 0x3C071B, 0x5C0701, 0x5A1C00, 0x583300, 0x563D00, 0x666100, 0x4F5504, 0x263E0F},
    {0x004D65, 0x012F7B, 0x1A0A52, 0x450D59, 0x551029, 0x831100, 0x7B2900, 0x7A4A00, 0x785800, 0x8D8602, 0x6F760A, 0x38571A},
    {0x016E8F, 0x0042A9, 0x2C0977, 0x61187C, 0x791A3D, 0xB51A00, 0xAD3E00, 0xA96800, 0xA67B01, 0xC4BC00, 0x9BA50E, 0x4E7A27},
    {0x008CB4, 0x0056D6, 0x371A94, 0x7A219E, 0x99244F, 0xE22400, 0xDA5100, 0xD38301, 0xD19D01, 0xF5EC00, 0xC3D117, 0x669D34},
    {0x00A1D8, 0x0061FE, 0x4D22B2, 0x982ABC, 0xB92D5D, 0xFF4015, 0xFF6A00, 0xFFAB01, 0xFDC700, 0xFEFB41, 0xD9EC37, 0x76BB40},
    {0x01C7FC, 0x3A87FE, 0x5E30EB, 0xBE38F3, 0xE63B7A, 0xFF6250, 0xFF8648, 0xFEB43F, 0xFECB3E, 0xFFF76B, 0xE4EF65, 0x96D35F},
    {0x52D6FC, 0x74A7FF, 0x864FFE, 0xD357FE, 0xEE719E, 0xFF8C82, 0xFFA57D, 0xFFC777, 0xFFD977, 0xFFF994, 0xEAF28F, 0xB1DD8B},
    {0x93E3FD, 0xA7C6FF, 0xB18CFE, 0xE292FE, 0xF4A4C0, 0xFFB5AF, 0xFFC5AB, 0xFFD9A8, 0xFEE4A8, 0xFFFBB9, 0xF2F7B7, 0xCDE8B5},
    {0xCBF0FF, 0xD3E2FF, 0xD9C9FE, 0xEFCAFF, 0xF9D3E0, 0xFFDBD8, 0xFFE2D6, 0xFFECD4, 0xFFF2D5, 0xFEFCDD, 0xF7FADB, 0xDFEED4},
};
// clang-format on

SomeColor fromRGB(std::uint32_t rgb)
{
    const auto component = [rgb](int shift) { return static_cast<double>((rgb >> shift) & 0xFF) / 255.0; };
    return {component(16), component(8), component(0), 1.0, SomeColor::ColorSpace::sRGB};
}

ColorMatrix buildDefaultMatrix()
{
    ColorMatrix matrix;
    for (const auto &row : swatches) {
        std::vector<SomeColor> colors;
        std::transform(std::begin(row), std::end(row), std::back_inserter(colors), fromRGB);
        matrix.push_back(std::move(colors));
    }
    return matrix;
}

SomeColor darkCounterpart(const SomeColor &color)
{
    return SomeColor(
        platform::convertColor(color.platformColor(), platform::Appearance::Light, platform::Appearance::Dark),
        SomeColor::ColorSpace::sRGB);
}

ColorMatrix buildDarkMatrix()
{
    ColorMatrix matrix = defaultColorMatrix();
    std::reverse(matrix.front().begin(), matrix.front().end());
    std::reverse(matrix.begin() + 1, matrix.end());
    for (auto &row : matrix)
        std::transform(row.begin(), row.end(), row.begin(), darkCounterpart);
    return matrix;
}

} // namespace

const ColorMatrix &defaultColorMatrix()
{
    static const ColorMatrix matrix = buildDefaultMatrix();
    return matrix;
}

const ColorMatrix &darkColorMatrix()
{
    static const ColorMatrix matrix = buildDarkMatrix();
    return matrix;
}

bool usesDarkPalette(const service::ColorPickerState &state, service::ColorScheme colorScheme)
{
    if (!state.enableDarkGrid())
        return false;
    return state.overrideColorScheme().value_or(colorScheme) == service::ColorScheme::Dark;
}

const ColorMatrix &activePalette(const service::ColorPickerState &state, service::ColorScheme colorScheme)
{
    return usesDarkPalette(state, colorScheme) ? darkColorMatrix() : defaultColorMatrix();
}

} // namespace favrin::grid
