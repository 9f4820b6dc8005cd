#include "sliders/componentfieldcoordinator.h"

namespace favrin::sliders {

ComponentFieldCoordinator::ComponentFieldCoordinator(QObject *parent) : CPTextFieldCoordinator(parent) {}

void ComponentFieldCoordinator::setComponent(ColorComponent::Name component)
{
    if (component == m_component)
        return;
    m_component = component;
    setTextField(textField());
    Q_EMIT componentChanged();
    Q_EMIT nameChanged();
}

QString ComponentFieldCoordinator::name() const
{
    return displayName(component());
}

CPTextField<double> ComponentFieldCoordinator::textField()
{
    SliderControlStyle style = sliderControlStyle(component());
    return {
        .value = {.read = [this] { return componentValue(*colorPickerState(), component()); },
                  .write = [this](double value) { setComponentValue(*colorPickerState(), component(), value); }},
        .allowUpdatesWhileEditing = true,
        .selectionOnNumber = component() == ColorComponent::Opacity,
        .keyboardType = KeyboardType::DecimalPad,
        .conversionToStringBlock = std::move(style.floatToTextMapping),
        .conversionToTypeBlock = std::move(style.textToFloatMapping),
        .shouldChangeCharacters = std::move(style.shouldChangeCharacters),
    };
}

} // namespace favrin::sliders
