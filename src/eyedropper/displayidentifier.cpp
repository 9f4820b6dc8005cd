#include "eyedropper/displayidentifier.h"

#include <QGuiApplication>
#include <QScreen>

#include <algorithm>

namespace favrin::eyedropper {

QString displayIdentifier(const QScreen *screen)
{
    if (!screen)
        return {};
    const QString serial = screen->serialNumber();
    return serial.isEmpty() ? screen->name() : screen->name() + u':' + serial;
}

QScreen *displayWithIdentifier(const QString &identifier)
{
    const auto screens = QGuiApplication::screens();
    const auto found = std::ranges::find(screens, identifier, displayIdentifier);
    return found == screens.end() ? nullptr : *found;
}

} // namespace favrin::eyedropper
