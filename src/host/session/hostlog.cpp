#include "host/session/hostlog.h"

namespace favrin::host {

Q_LOGGING_CATEGORY(hostLog, "com.quenta.favrin.ColorPicker.Host", QtWarningMsg)

} // namespace favrin::host
