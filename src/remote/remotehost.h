#pragma once

#include "platform/color/color.h"
#include "remote/records.h"

#include <functional>
#include <optional>
#include <string>

namespace favrin::remote {

/**
 * The host as the service sees it: the messages of `_FVColorPickerRemoteViewControllerHost`, and what a remote view
 * tells its host besides. One-way; none of them waits. May be called on any thread.
 */
class RemoteHost
{
public:
    virtual ~RemoteHost() = default;
    virtual void pickerDidSelectColor(const std::optional<platform::Color> &color,
                                      const std::optional<std::string> &colorspace, bool isVolatile) = 0;
    virtual void pickerDidShowEyedropper() = 0;
    virtual void pickerDidFloatEyedropper() = 0;
    virtual void pickerDidDismissEyedropper() = 0;
    virtual void colorPickerDidFinish() = 0;

    /** Points. */
    virtual void preferredContentSizeDidChange(double width, double height) = 0;
    virtual void backgroundEffectDidChange(BackgroundEffect effect) = 0;
};

/** What the host says to the service: the messages of `_FVColorPickerRemoteViewController`. Main thread. */
class RemoteViewController
{
public:
    virtual ~RemoteViewController() = default;
    /** @p colorspace is the platform name of the space that the picker shall work in. */
    virtual void setSelectedColor(const std::optional<platform::Color> &color,
                                  const std::optional<std::string> &colorspace) = 0;
    virtual void setConfiguration(const Configuration &configuration) = 0;
    virtual void prepareForDisplay(std::function<void()> completion) = 0;
    virtual void colorPickerDidFinish() = 0;
};

} // namespace favrin::remote
