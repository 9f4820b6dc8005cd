#include "sliders/colorspacelabel.h"

#include "platform/strings/localizedstring.h"

namespace favrin::sliders {

QString colorSpaceLabel(model::SomeColor::ColorSpace space)
{
    const auto format = QString::fromStdString(platform::localizedString(
        "%@ Hex Color #",
        "The button that opens the color space switcher. %@ is the currently selected color space. The button also "
        "functions as a label for the hex code that follows in a textfield."));
    return QString(format).replace(QStringLiteral("%@"), QString::fromStdString(model::displayName(space)));
}

} // namespace favrin::sliders
