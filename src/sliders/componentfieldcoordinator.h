#pragma once

#include "sliders/colorcomponent.h"
#include "sliders/cptextfieldcoordinator.h"

namespace favrin::sliders {

/** Of the number field beside a slider: one component of the selected color, in the component's style. */
class ComponentFieldCoordinator : public favrin::sliders::CPTextFieldCoordinator
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::sliders::ColorComponent::Name component READ component WRITE setComponent NOTIFY componentChanged
                   REQUIRED FINAL)

public:
    explicit ComponentFieldCoordinator(QObject *parent = nullptr);

    ColorComponent::Name component() const { return m_component.value_or(ColorComponent::Red); }
    void setComponent(ColorComponent::Name component);
    QString name() const override;

Q_SIGNALS:
    void componentChanged();

private:
    CPTextField<double> textField();

    std::optional<ColorComponent::Name> m_component;
};

} // namespace favrin::sliders
