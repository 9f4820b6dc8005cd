#pragma once

#include "theme/semanticcolors.h"
#include "theme/textstyle.h"

#include <QFont>
#include <QObject>
#include <QtQmlIntegration/qqmlintegration.h>

class QJSEngine;
class QQmlEngine;

namespace favrin::theme {

/**
 * The one visual language of the picker: colors by their meaning, text by its role, direction and motion. There is one
 * per process; whoever knows the surroundings (the host's traits) sets it. Main thread only.
 *
 * The colors are drawing colors: they hold numbers of the surface's color space.
 */
class Theme : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    QML_SINGLETON

    Q_PROPERTY(QColor label READ label NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor secondaryLabel READ secondaryLabel NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor tertiaryLabel READ tertiaryLabel NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor systemBackground READ systemBackground NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor systemGray READ systemGray NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor systemGray5 READ systemGray5 NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor systemRed READ systemRed NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor separator READ separator NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor tint READ tint NOTIFY colorsChanged FINAL)
    Q_PROPERTY(QColor fill READ fill NOTIFY colorsChanged FINAL)

    Q_PROPERTY(QFont headlineFont READ headlineFont NOTIFY textSizeCategoryChanged FINAL)
    Q_PROPERTY(QFont bodyFont READ bodyFont NOTIFY textSizeCategoryChanged FINAL)
    Q_PROPERTY(QFont subheadlineFont READ subheadlineFont NOTIFY textSizeCategoryChanged FINAL)
    Q_PROPERTY(QFont footnoteFont READ footnoteFont NOTIFY textSizeCategoryChanged FINAL)
    Q_PROPERTY(int barSymbolSize READ barSymbolSize NOTIFY textSizeCategoryChanged FINAL)

    Q_PROPERTY(bool isDark READ isDark NOTIFY colorsChanged FINAL)
    Q_PROPERTY(bool isMirrored READ isMirrored NOTIFY layoutDirectionChanged FINAL)
    Q_PROPERTY(bool increaseContrast READ increaseContrast NOTIFY colorsChanged FINAL)
    Q_PROPERTY(bool reduceMotion READ reduceMotion NOTIFY reduceMotionChanged FINAL)

public:
    /** The theme of this process. */
    static Theme &instance();
    /** For the QML engine: the theme of this process, which no engine owns. */
    static Theme *create(QQmlEngine *qmlEngine, QJSEngine *jsEngine);

    service::ColorScheme colorScheme() const { return m_colorScheme; }
    void setColorScheme(service::ColorScheme scheme);
    bool increaseContrast() const { return m_contrast == Contrast::Increased; }
    void setIncreaseContrast(bool increase);
    TextSizeCategory textSizeCategory() const { return m_textSizeCategory; }
    void setTextSizeCategory(TextSizeCategory category);
    Qt::LayoutDirection layoutDirection() const { return m_layoutDirection; }
    void setLayoutDirection(Qt::LayoutDirection direction);
    bool reduceMotion() const { return m_reduceMotion; }
    void setReduceMotion(bool reduce);
    /** To be called after the language or the formats of the process became others. */
    void noteLocaleChanged() { Q_EMIT localeChanged(); }

    QColor label() const { return m_colors.label; }
    QColor secondaryLabel() const { return m_colors.secondaryLabel; }
    QColor tertiaryLabel() const { return m_colors.tertiaryLabel; }
    QColor systemBackground() const { return m_colors.systemBackground; }
    QColor systemGray() const { return m_colors.systemGray; }
    QColor systemGray5() const { return m_colors.systemGray5; }
    QColor systemRed() const { return m_colors.systemRed; }
    QColor separator() const { return m_colors.separator; }
    QColor tint() const { return m_colors.tint; }
    QColor fill() const { return m_colors.fill; }

    /** Semibold body text. This and the other fonts grow up to the extra-extra-extra-large category. */
    QFont headlineFont() const;
    /** What every picker shows at the usual text size, the tabs' first. Needs no instance. */
    static QList<QFont> usualFonts();
    QFont bodyFont() const;
    QFont subheadlineFont() const;
    QFont footnoteFont() const;
    /** Body size of the symbols in the navigation bar, which grow up to the extra-large category. */
    int barSymbolSize() const;

    bool isDark() const { return m_colorScheme == service::ColorScheme::Dark; }
    bool isMirrored() const { return m_layoutDirection == Qt::RightToLeft; }

Q_SIGNALS:
    /** The scheme, the contrast or the surface's space changed, and all colors with it. */
    void colorsChanged();
    void textSizeCategoryChanged();
    void layoutDirectionChanged();
    void reduceMotionChanged();
    /** Texts and numbers are to be asked for again. */
    void localeChanged();

private:
    Theme();
    void updateColors();
    QFont font(TextStyle style) const;

    service::ColorScheme m_colorScheme = service::ColorScheme::Light;
    Contrast m_contrast = Contrast::Standard;
    TextSizeCategory m_textSizeCategory = TextSizeCategory::Large;
    Qt::LayoutDirection m_layoutDirection = Qt::LeftToRight;
    bool m_reduceMotion = false;
    SemanticColors m_colors;
};

} // namespace favrin::theme
