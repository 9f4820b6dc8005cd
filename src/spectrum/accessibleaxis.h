#pragma once

#include "platform/accessibility/accessiblepart.h"

namespace favrin::spectrum {

class Spectrum;

/** One axis of the field as assistive technologies see it: a slider, which picks finally. */
class AccessibleAxis : public platform::AccessiblePart, public QAccessibleValueInterface
{
public:
    enum class Axis {
        /** 0 to 360, from the top to the bottom. */
        Hue,
        /** 0 to 100, from black at the right to white at the left. */
        Lightness
    };

    AccessibleAxis(Spectrum &spectrum, Axis axis);

    QString text(QAccessible::Text kind) const override;
    QAccessible::Role role() const override { return QAccessible::Slider; }
    void *interface_cast(QAccessible::InterfaceType type) override;

    QVariant currentValue() const override;
    void setCurrentValue(const QVariant &value) override;
    QVariant maximumValue() const override;
    QVariant minimumValue() const override { return 0.0; }
    QVariant minimumStepSize() const override;

    QStringList actionNames() const override;
    void doAction(const QString &actionName) override;

    Axis axis() const { return m_axis; }

private:
    Spectrum *spectrum() const;

    Axis m_axis;
};

} // namespace favrin::spectrum
