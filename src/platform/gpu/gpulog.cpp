#include "platform/gpu/gpulog.h"

namespace favrin::platform::gpu {

const Log &gpuLog()
{
    static const Log log("com.quenta.favrin.platform", "GPU");
    return log;
}

} // namespace favrin::platform::gpu
