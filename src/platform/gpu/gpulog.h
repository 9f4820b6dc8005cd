#pragma once

#include "platform/log/log.h"

namespace favrin::platform::gpu {

/** Where devices say what they could not do. */
const Log &gpuLog();

} // namespace favrin::platform::gpu
