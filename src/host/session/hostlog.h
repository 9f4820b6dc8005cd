#pragma once

#include <QLoggingCategory>

namespace favrin::host {

/** "com.quenta.favrin.ColorPicker.Host": what the library in the app has to say; warnings and worse unless filtered. */
Q_DECLARE_LOGGING_CATEGORY(hostLog)

} // namespace favrin::host
