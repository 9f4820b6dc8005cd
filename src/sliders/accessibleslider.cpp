#include "sliders/accessibleslider.h"

#include "sliders/cpslider.h"
#include "sliders/sliderrules.h"

#include <QAccessibleObject>
#include <QQuickWindow>

#include <algorithm>
#include <cmath>

namespace favrin::sliders {
namespace {

class AccessibleSlider : public QAccessibleObject, public QAccessibleValueInterface, public QAccessibleActionInterface
{
public:
    explicit AccessibleSlider(CPSlider *slider) : QAccessibleObject(slider)
    {
        m_valueChanged = QObject::connect(slider, &CPSlider::valueChanged, slider, [this] { announceValue(); });
    }

    ~AccessibleSlider() override { QObject::disconnect(m_valueChanged); }

    QWindow *window() const override { return slider()->window(); }

    QAccessibleInterface *parent() const override
    {
        for (QQuickItem *item = slider()->parentItem(); item; item = item->parentItem()) {
            if (QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(item))
                return interface;
        }
        return QAccessible::queryAccessibleInterface(window());
    }

    int childCount() const override { return 0; }
    QAccessibleInterface *child(int) const override { return nullptr; }
    QAccessibleInterface *childAt(int, int) const override { return nullptr; }
    int indexOfChild(const QAccessibleInterface *) const override { return -1; }

    QString text(QAccessible::Text kind) const override
    {
        if (kind == QAccessible::Name)
            return slider()->name();
        return kind == QAccessible::Value ? slider()->valueText() : QString();
    }

    QRect rect() const override
    {
        if (!window())
            return {};
        const QRectF inWindow = slider()->mapRectToScene(slider()->boundingRect());
        return QRectF(window()->mapToGlobal(inWindow.topLeft()), inWindow.size()).toRect();
    }

    QAccessible::Role role() const override { return QAccessible::Slider; }

    QAccessible::State state() const override
    {
        QAccessible::State state;
        state.focusable = true;
        state.focused = slider()->hasActiveFocus();
        state.invisible = !slider()->isVisible();
        state.disabled = !slider()->isEnabled();
        return state;
    }

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
    CPSlider *slider() const { return static_cast<CPSlider *>(object()); }
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
