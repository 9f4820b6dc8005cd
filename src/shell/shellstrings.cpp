#include "shell/shellstrings.h"

#include "platform/strings/localizedstring.h"
#include "theme/theme.h"

#include <QLocale>

namespace favrin::shell {

using platform::localizedString;

ShellStrings::ShellStrings(QObject *parent) : QObject(parent)
{
    connect(&theme::Theme::instance(), &theme::Theme::localeChanged, this, &ShellStrings::localeChanged);
}

QString ShellStrings::close()
{
    return QString::fromStdString(localizedString("Close", "Button that closes the color picker"));
}

QString ShellStrings::colorPickerType()
{
    return QString::fromStdString(localizedString(
        "Color Picker Type", "Label for the segmented control that switches between grid, spectrum, sliders"));
}

QString ShellStrings::copy()
{
    return QString::fromStdString(localizedString("Copy", "Menu command that copies the selected color"));
}

QString ShellStrings::eyedropper()
{
    return QString::fromStdString(
        localizedString("Eyedropper_Accessibility", "Button that launches eyedropper color picker"));
}

QString ShellStrings::eyedropperAlternatives()
{
    const QStringList words = {
        QString::fromStdString(
            localizedString("Eyedropper_Accessibility_Alternative1", "Alternative label for eye dropper")),
        QString::fromStdString(
            localizedString("Eyedropper_Accessibility_Alternative2", "Alternative label for eye dropper")),
    };
    return QLocale().createSeparatedList(words);
}

QString ShellStrings::selectedColor()
{
    return QString::fromStdString(localizedString("Selected Color", "The currently selected color"));
}

} // namespace favrin::shell
