#pragma once

namespace favrin::theme {

/** The text size that the user asked for, from the smallest up; Large is the default. Numbers as in the traits. */
enum class TextSizeCategory {
    ExtraSmall,
    Small,
    Medium,
    Large,
    ExtraLarge,
    ExtraExtraLarge,
    ExtraExtraExtraLarge,
    AccessibilityMedium,
    AccessibilityLarge,
    AccessibilityExtraLarge,
    AccessibilityExtraExtraLarge,
    AccessibilityExtraExtraExtraLarge,
};

enum class TextStyle { Headline, Body, Subheadline, Footnote };

/** The size of a style in points, for the smaller of @p category and @p cap. */
int textSize(TextStyle style, TextSizeCategory category, TextSizeCategory cap);

} // namespace favrin::theme
