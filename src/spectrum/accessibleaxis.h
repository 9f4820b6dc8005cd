#pragma once

#include <QAccessibleInterface>
#include <QPointer>

namespace favrin::spectrum {

class Spectrum;

/** One axis of the field as assistive technologies see it: a slider, which picks finally. */
class AccessibleAxis : public QAccessibleInterface, public QAccessibleValueInterface, public QAccessibleActionInterface
{
public:
    enum class Axis {
        /** 0 to 360, from the top to the bottom. */
        Hue,
        /** 0 to 100, from black at the right to white at the left. */
        Lightness
    };

    AccessibleAxis(Spectrum &spectrum, Axis axis);

    bool isValid() const override { return !m_spectrum.isNull(); }
    QObject *object() const override { return nullptr; }
    QWindow *window() const override;
    QAccessibleInterface *parent() const override;
    QAccessibleInterface *child(int) const override { return nullptr; }
    QAccessibleInterface *childAt(int, int) const override { return nullptr; }
    int childCount() const override { return 0; }
    int indexOfChild(const QAccessibleInterface *) const override { return -1; }
    QString text(QAccessible::Text kind) const override;
    void setText(QAccessible::Text, const QString &) override {}
    QRect rect() const override;
    QAccessible::Role role() const override { return QAccessible::Slider; }
    QAccessible::State state() const override;
    void *interface_cast(QAccessible::InterfaceType type) override;

    QVariant currentValue() const override;
    void setCurrentValue(const QVariant &value) override;
    QVariant maximumValue() const override;
    QVariant minimumValue() const override { return 0.0; }
    QVariant minimumStepSize() const override;

    QStringList actionNames() const override;
    void doAction(const QString &actionName) override;
    QStringList keyBindingsForAction(const QString &) const override { return {}; }

    Axis axis() const { return m_axis; }

private:
    QPointer<Spectrum> m_spectrum;
    Axis m_axis;
};

} // namespace favrin::spectrum
