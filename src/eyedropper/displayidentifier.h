#pragma once

#include <QString>

class QScreen;

namespace favrin::eyedropper {

/** What identifies a display: the name of its connector, with its serial number when it tells one. Empty for null. */
QString displayIdentifier(const QScreen *screen);

/** The display with this identifier, or null. GUI thread. */
QScreen *displayWithIdentifier(const QString &identifier);

} // namespace favrin::eyedropper
