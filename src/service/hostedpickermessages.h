#pragma once

#include "remote/remotehost.h"
#include "service/eyedroppersession.h"

namespace favrin::service {

/** The class name under which the hosted picker is registered and the front creates it. */
inline constexpr const char *hostedPickerClassName = "_FVColorPickerServiceViewController";

/** What the front tells the hosted picker: the messages of `__FVColorPickerRemoteViewController`. Main thread. */
class FVColorPickerRemoteViewController : public remote::RemoteViewController
{
public:
    virtual void setIsPresentedAsPopover(bool popover) = 0;
    virtual void setIsLandscape(bool landscape) = 0;
    /** Takes over favorites and tab where another picker has changed them since this one was made. */
    virtual void reloadPersistedValues() = 0;
};

/** What the hosted picker tells its parent, which is the front and nobody else. Main thread. */
class HostedPickerParent
{
public:
    virtual ~HostedPickerParent() = default;
    /** None for no color. */
    virtual void pickerDidSelectColor(const std::optional<platform::Color> &color, bool isVolatile) = 0;
    virtual void pickerDidShowEyedropper(EyedropperSelectionBlock selectionBlock,
                                         EyedropperDismissBlock dismissBlock) = 0;
    virtual void pickerDidFloatEyeDropper() = 0;
    virtual void pickerDidCancelEyeDropper() = 0;
    virtual void colorPickerDidFinish() = 0;
    virtual void updatePreferredContentSize() = 0;
};

} // namespace favrin::service
