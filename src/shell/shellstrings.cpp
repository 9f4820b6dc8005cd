#include "shell/shellstrings.h"

#include "platform/strings/localizedstring.h"

namespace favrin::shell {

QString ShellStrings::close() const
{
    return QString::fromStdString(platform::localizedString("Close", "Button that closes the color picker"));
}

QString ShellStrings::colorPickerType() const
{
    return QString::fromStdString(platform::localizedString(
        "Color Picker Type", "Label for the segmented control that switches between grid, spectrum, sliders"));
}

} // namespace favrin::shell
