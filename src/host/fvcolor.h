#pragma once

#include "favrinhostexport.h"

#include <QColor>
#include <QColorSpace>
#include <QMetaType>
#include <QString>
#include <QtQmlIntegration/qqmlintegration.h>

/**
 * A color as the picker and its host exchange it: gamma-encoded components of a named space, in double precision.
 *
 * The value is held bit for bit: what an app sets comes back unchanged when the user changes nothing. A default-made
 * color is "no color". In QML the value type is `fvColor`; any thread may use it.
 */
class FAVRIN_HOST_EXPORT FVColor
{
    Q_GADGET
    QML_VALUE_TYPE(fvColor)

    Q_PROPERTY(bool valid READ isValid)
    Q_PROPERTY(double red READ red)
    Q_PROPERTY(double green READ green)
    Q_PROPERTY(double blue READ blue)
    Q_PROPERTY(double alpha READ alpha)
    Q_PROPERTY(QString colorSpace READ colorSpace)

public:
    ///@{
    /** Platform name of a space that the picker works in. */
    static QString sRGBName();
    static QString displayP3Name();
    ///@}

    /** No color. */
    FVColor() = default;
    /**
     * Components of @p colorSpace, nominally 0…1, and opacity 0…1. @p colorSpace is a platform name: sRGBName(),
     * displayP3Name(), "kTQColorSpaceExtendedSRGB" or "kTQColorSpaceLinearSRGB". A component that is not finite makes
     * no color.
     */
    FVColor(double red, double green, double blue, double alpha = 1.0, const QString &colorSpace = sRGBName());

    /**
     * The color of numbers that @p space interprets. sRGB, Display P3 and linear sRGB keep their numbers; a color of
     * another space becomes linear sRGB without loss, one of a space that only Qt can read (a display profile, say)
     * becomes sRGB. An invalid color becomes no color.
     */
    static FVColor fromQColor(const QColor &color, const QColorSpace &space = QColorSpace(QColorSpace::SRgb));
    /** As QColor reads it: in sRGB, clipped to 0…1. Invalid for no color. */
    Q_INVOKABLE QColor toQColor() const;

    /** False for no color, whose numbers are all 0. */
    bool isValid() const { return m_valid; }
    ///@{
    /** Gamma-encoded component of the color's own space, nominally 0…1. */
    double red() const { return m_red; }
    double green() const { return m_green; }
    double blue() const { return m_blue; }
    ///@}
    /** Opacity: 0 transparent, 1 opaque. */
    double alpha() const { return m_alpha; }
    /** Platform name of the space, empty for no color. */
    QString colorSpace() const { return m_colorSpace; }

    /** Equal numbers in the same space, or both no color. */
    bool operator==(const FVColor &other) const = default;

private:
    bool m_valid = false;
    double m_red = 0.0;
    double m_green = 0.0;
    double m_blue = 0.0;
    double m_alpha = 0.0;
    QString m_colorSpace;
};

Q_DECLARE_METATYPE(FVColor)
