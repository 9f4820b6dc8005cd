#pragma once

#include "model/somecolor.h"
#include "sliders/slidercontrolstyle.h"

#include <QObject>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::service {
class ColorPickerState;
}

namespace favrin::sliders {

/** Names a component of the selected color in QML. */
class ColorComponent : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    QML_UNCREATABLE("Names only")

public:
    enum Name { Red, Green, Blue, Opacity };
    Q_ENUM(Name)
};

/** The component of the color value that @p name means. */
model::SomeColor::Component component(ColorComponent::Name name);

/** The component's localized name. */
QString displayName(ColorComponent::Name name);

/** How the component is shown in a text field; looked up anew on every call. */
SliderControlStyle sliderControlStyle(ColorComponent::Name name);

/** The component of the selected color, or of the fallback color while none is selected. */
double componentValue(const service::ColorPickerState &state, ColorComponent::Name name);

/** Selects the same color with one component replaced; nothing is clamped. */
void setComponentValue(service::ColorPickerState &state, ColorComponent::Name name, double value);

} // namespace favrin::sliders
