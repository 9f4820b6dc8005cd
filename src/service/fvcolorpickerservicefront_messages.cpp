// What passes through the front, from the host and to the host.

#include "service/fvcolorpickerservicefront.h"

namespace favrin::service {

FVColorPickerRemoteViewController *FVColorPickerServiceFront::loadedChild()
{
    // A host may talk before it shows anything; what it says must reach the hosted picker.
    view();
    return m_child;
}

void FVColorPickerServiceFront::setSelectedColor(const std::optional<platform::Color> &color,
                                                 const std::optional<std::string> &colorspace)
{
    if (auto *child = loadedChild())
        child->setSelectedColor(color, colorspace);
}

void FVColorPickerServiceFront::setConfiguration(const remote::Configuration &configuration)
{
    m_configuration = configuration;
    if (auto *child = loadedChild())
        child->setConfiguration(configuration);
    updateBackground();
    updatePreferredContentSize();
    // The room for the keyboard takes effect in the layout pass.
    layoutNow();
}

void FVColorPickerServiceFront::localeDidChange()
{
    // The default title is a text of ours.
    if (const auto configuration = m_configuration)
        setConfiguration(*configuration);
}

void FVColorPickerServiceFront::prepareForDisplay(std::function<void()> completion)
{
    auto *child = loadedChild();
    updatePreferredContentSize();
    if (child)
        child->prepareForDisplay(std::move(completion));
    else if (completion)
        completion();
}

void FVColorPickerServiceFront::colorPickerDidFinish()
{
    if (auto *host = m_host())
        host->colorPickerDidFinish();
}

void FVColorPickerServiceFront::reloadPersistedValues()
{
    if (m_child)
        m_child->reloadPersistedValues();
}

void FVColorPickerServiceFront::pickerDidSelectColor(const std::optional<platform::Color> &color, bool isVolatile)
{
    auto *host = m_host();
    if (!host)
        return;
    const bool hasSpace = color && color->colorSpace();
    host->pickerDidSelectColor(color, hasSpace ? color->colorSpace()->name() : std::nullopt, isVolatile);
}

void FVColorPickerServiceFront::pickerDidShowEyedropper(EyedropperSelectionBlock selectionBlock,
                                                        EyedropperDismissBlock dismissBlock)
{
    m_eyedropper.show(std::move(selectionBlock), std::move(dismissBlock));
}

void FVColorPickerServiceFront::pickerDidFloatEyeDropper()
{
    m_eyedropper.floatEyedropper();
}

void FVColorPickerServiceFront::pickerDidCancelEyeDropper()
{
    m_eyedropper.cancel();
}

} // namespace favrin::service
