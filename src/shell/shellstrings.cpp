#include "shell/shellstrings.h"

#include "platform/strings/localizedstring.h"

namespace favrin::shell {

QString ShellStrings::close() const
{
    return QString::fromStdString(platform::localizedString("Close", "Button that closes the color picker"));
}

} // namespace favrin::shell
