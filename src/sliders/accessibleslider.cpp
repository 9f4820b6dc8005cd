#include "sliders/accessibleslider.h"

#include "platform/accessibility/accessibleitem.h"
#include "sliders/cpslider.h"
#include "sliders/sliderrules.h"

#include <algorithm>
#include <cmath>

namespace favrin::sliders {
namespace {

class AccessibleSlider : public platform::AccessibleItem,
                         public QAccessibleValueInterface,
                         public QAccessibleActionInterface
{
public:
    explicit AccessibleSlider(CPSlider *slider) : AccessibleItem(slider)
    {
        m_valueChanged = QObject::connect(slider, &CPSlider::valueChanged, slider, [this] { announceValue(); });
    }

    ~AccessibleSlider() override { QObject::disconnect(m_valueChanged); }

    QString text(QAccessible::Text kind) const override
    {
        if (kind == QAccessible::Name)
            return slider()->name();
        return kind == QAccessible::Value ? slider()->valueText() : QString();
    }

    QAccessible::Role role() const override { return QAccessible::Slider; }

    void *interface_cast(QAccessible::InterfaceType type) override
    {
        if (type == QAccessible::ValueInterface)
            return static_cast<QAccessibleValueInterface *>(this);
        return type == QAccessible::ActionInterface ? static_cast<QAccessibleActionInterface *>(this) : nullptr;
    }

    // The scale of the text: what is read aloud is then what is shown.
    QVariant currentValue() const override { return std::round(slider()->value() * scale()); }
    QVariant minimumValue() const override { return 0.0; }
    QVariant maximumValue() const override { return scale(); }
    QVariant minimumStepSize() const override { return 1.0; }

    void setCurrentValue(const QVariant &value) override
    {
        bool isNumber = false;
        const double number = value.toDouble(&isNumber);
        if (isNumber && std::isfinite(number))
            write(std::clamp(number / scale(), 0.0, 1.0));
    }

    QStringList actionNames() const override { return {increaseAction(), decreaseAction()}; }
    QStringList keyBindingsForAction(const QString &) const override { return {}; }

    void doAction(const QString &actionName) override
    {
        if (actionName == increaseAction())
            write(incremented(slider()->value()));
        else if (actionName == decreaseAction())
            write(decremented(slider()->value()));
    }

private:
    CPSlider *slider() const { return static_cast<CPSlider *>(item()); }
    double scale() const { return shownSteps(component(slider()->component())); }

    void write(double value)
    {
        if (slider()->isEnabled())
            slider()->setValue(value);
    }

    void announceValue()
    {
        QAccessibleValueChangeEvent event(slider(), currentValue());
        QAccessible::updateAccessibility(&event);
    }

    QMetaObject::Connection m_valueChanged;
};

QAccessibleInterface *makeAccessibleSlider(const QString &, QObject *object)
{
    auto *slider = qobject_cast<CPSlider *>(object);
    return slider ? new AccessibleSlider(slider) : nullptr;
}

} // namespace

void installAccessibleSlider()
{
    // Installing the same factory again replaces nothing and adds nothing.
    QAccessible::installFactory(makeAccessibleSlider);
}

} // namespace favrin::sliders
