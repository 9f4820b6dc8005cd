#include "sliders/colorcomponent.h"

#include "platform/strings/localizedstring.h"
#include "service/colorpickerstate.h"
#include "sliders/integerslidercontrolstyle.h"
#include "sliders/percentageslidercontrolstyle.h"

namespace favrin::sliders {

using model::SomeColor;
using platform::localizedString;

namespace {

std::string localizedName(ColorComponent::Name name)
{
    switch (name) {
    case ColorComponent::Red:
        return localizedString("Red", "The color red");
    case ColorComponent::Green:
        return localizedString("Green", "The color green");
    case ColorComponent::Blue:
        return localizedString("Blue", "The color blue");
    case ColorComponent::Opacity:
        return localizedString("Opacity", "Label for the opacity slider");
    }
    return {};
}

} // namespace

SomeColor::Component component(ColorComponent::Name name)
{
    return static_cast<SomeColor::Component>(name);
}

QString displayName(ColorComponent::Name name)
{
    return QString::fromStdString(localizedName(name));
}

SliderControlStyle sliderControlStyle(ColorComponent::Name name)
{
    if (name == ColorComponent::Opacity)
        return PercentageSliderControlStyle();
    return IntegerSliderControlStyle();
}

double componentValue(const service::ColorPickerState &state, ColorComponent::Name name)
{
    return state.colorBinding()[component(name)];
}

void setComponentValue(service::ColorPickerState &state, ColorComponent::Name name, double value)
{
    state.setColorBinding(state.colorBinding().setting(component(name), value));
}

} // namespace favrin::sliders
