#pragma once

#include "platform/log/log.h"

namespace favrin::service {

/** The one log of the picker, made on first use. Thread-safe. */
const platform::Log &colorPickerLog();

} // namespace favrin::service
