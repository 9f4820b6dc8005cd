#include "theme/textstyle.h"

#include <algorithm>
#include <array>

namespace favrin::theme {
namespace {

constexpr std::array bodySizes = {14, 15, 16, 17, 19, 21, 23, 28, 33, 40, 47, 53};
constexpr int smallestSize = 11;

int belowBody(TextStyle style)
{
    switch (style) {
    case TextStyle::Headline:
    case TextStyle::Body:
        return 0;
    case TextStyle::Subheadline:
        return 2;
    case TextStyle::Footnote:
        return 4;
    }
    return 0;
}

} // namespace

int textSize(TextStyle style, TextSizeCategory category, TextSizeCategory cap)
{
    const auto size = bodySizes[static_cast<std::size_t>(std::min(category, cap))];
    return std::max(size - belowBody(style), smallestSize);
}

} // namespace favrin::theme
