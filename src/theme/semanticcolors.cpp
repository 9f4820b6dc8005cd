#include "theme/semanticcolors.h"

namespace favrin::theme {
namespace {

/** Rows: standard, increased contrast. Columns: light, dark. */
struct Variants
{
    QRgb colors[2][2];
};

constexpr Variants label = {{{0xff000000, 0xffffffff}, {0xff000000, 0xffffffff}}};
constexpr Variants secondaryLabel = {{{0x99000000, 0x99ffffff}, {0xcc000000, 0xccffffff}}};
constexpr Variants tertiaryLabel = {{{0x59000000, 0x59ffffff}, {0x99000000, 0x99ffffff}}};
constexpr Variants systemBackground = {{{0xffffffff, 0xff161618}, {0xffffffff, 0xff000000}}};
constexpr Variants systemGray = {{{0xff8a8a8f, 0xff8f8f94}, {0xff66666b, 0xffb0b0b5}}};
constexpr Variants systemGray5 = {{{0xffe4e4e8, 0xff2d2d30}, {0xffd3d3d8, 0xff3a3a3e}}};
constexpr Variants systemRed = {{{0xffe5352b, 0xffff5347}, {0xffbb1a12, 0xffff7a70}}};
constexpr Variants separator = {{{0x33000000, 0x40ffffff}, {0x73000000, 0x80ffffff}}};
constexpr Variants tint = {{{0xff0b68d4, 0xff4b9dff}, {0xff0046a0, 0xff8cc2ff}}};
constexpr Variants fill = {{{0x24787880, 0x5c787880}, {0x45787880, 0x8a787880}}};

} // namespace

SemanticColors semanticColors(service::ColorScheme scheme, Contrast contrast)
{
    const auto pick = [scheme, contrast](const Variants &variants) {
        const int row = contrast == Contrast::Increased ? 1 : 0;
        const int column = scheme == service::ColorScheme::Dark ? 1 : 0;
        return QColor::fromRgba(variants.colors[row][column]);
    };
    return {
        .label = pick(label),
        .secondaryLabel = pick(secondaryLabel),
        .tertiaryLabel = pick(tertiaryLabel),
        .systemBackground = pick(systemBackground),
        .systemGray = pick(systemGray),
        .systemGray5 = pick(systemGray5),
        .systemRed = pick(systemRed),
        .separator = pick(separator),
        .tint = pick(tint),
        .fill = pick(fill),
    };
}

} // namespace favrin::theme
