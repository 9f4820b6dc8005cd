#include "theme/theme.h"

#include "service/displaycolor.h"

#include <QGuiApplication>
#include <QJSEngine>

#include <algorithm>

namespace favrin::theme {

using service::ColorScheme;
using service::DisplayColor;

namespace {

QFont fontOf(TextStyle style, TextSizeCategory category)
{
    QFont font = QGuiApplication::font();
    font.setPixelSize(textSize(style, category, TextSizeCategory::ExtraExtraExtraLarge));
    if (style == TextStyle::Headline)
        font.setWeight(QFont::DemiBold);
    return font;
}

} // namespace

Theme::Theme()
{
    updateColors();
    connect(&DisplayColor::instance(), &DisplayColor::surfaceColorSpaceChanged, this, &Theme::updateColors);
}

Theme &Theme::instance()
{
    static Theme theme;
    return theme;
}

Theme *Theme::create(QQmlEngine *, QJSEngine *)
{
    QJSEngine::setObjectOwnership(&instance(), QJSEngine::CppOwnership);
    return &instance();
}

void Theme::setColorScheme(ColorScheme scheme)
{
    if (scheme == m_colorScheme)
        return;
    m_colorScheme = scheme;
    updateColors();
}

void Theme::setIncreaseContrast(bool increase)
{
    if (increase == increaseContrast())
        return;
    m_contrast = increase ? Contrast::Increased : Contrast::Standard;
    updateColors();
}

void Theme::setTextSizeCategory(TextSizeCategory category)
{
    // The number comes from another process.
    category = std::clamp(category, TextSizeCategory::ExtraSmall, TextSizeCategory::AccessibilityExtraExtraExtraLarge);
    if (category == m_textSizeCategory)
        return;
    m_textSizeCategory = category;
    Q_EMIT textSizeCategoryChanged();
}

void Theme::setLayoutDirection(Qt::LayoutDirection direction)
{
    if (direction == m_layoutDirection)
        return;
    m_layoutDirection = direction;
    Q_EMIT layoutDirectionChanged();
}

void Theme::setReduceMotion(bool reduce)
{
    if (reduce == m_reduceMotion)
        return;
    m_reduceMotion = reduce;
    Q_EMIT reduceMotionChanged();
}

QFont Theme::font(TextStyle style) const
{
    return fontOf(style, m_textSizeCategory);
}

QFont Theme::headlineFont() const
{
    return font(TextStyle::Headline);
}

QFont Theme::bodyFont() const
{
    return font(TextStyle::Body);
}

QFont Theme::subheadlineFont() const
{
    return font(TextStyle::Subheadline);
}

QFont Theme::footnoteFont() const
{
    return font(TextStyle::Footnote);
}

QList<QFont> Theme::usualFonts()
{
    constexpr auto size = TextSizeCategory::Large;
    QFont field = fontOf(TextStyle::Body, size);
    field.setWeight(QFont::Medium);
    QFont caption = fontOf(TextStyle::Footnote, size);
    caption.setWeight(QFont::DemiBold);
    return {fontOf(TextStyle::Subheadline, size), fontOf(TextStyle::Headline, size), field, caption};
}

int Theme::barSymbolSize() const
{
    return textSize(TextStyle::Body, m_textSizeCategory, TextSizeCategory::ExtraLarge);
}

void Theme::updateColors()
{
    m_colors = semanticColors(m_colorScheme, m_contrast);
    for (QColor *color : {&m_colors.label, &m_colors.secondaryLabel, &m_colors.tertiaryLabel,
                          &m_colors.systemBackground, &m_colors.systemGray, &m_colors.systemGray5, &m_colors.systemRed,
                          &m_colors.separator, &m_colors.tint, &m_colors.fill})
        *color = DisplayColor::instance().interfaceColor(*color);
    Q_EMIT colorsChanged();
}

} // namespace favrin::theme
