#include "apps/service/serviceconfinement.h"

#include "platform/confinement/confinement.h"
#include "platform/confinement/inheritance.h"
#include "platform/defaults/defaultsfile.h"
#include "platform/defaults/defaultslocation.h"
#include "platform/log/log.h"

#include <QByteArray>
#include <QtGlobal>

#include <chrono>

namespace favrin::apps {

namespace {

/** The drivers of GPUs would keep compiled shaders in a folder of their own. */
void keepNoShaders()
{
    qputenv("MESA_SHADER_CACHE_DISABLE", "true");
    qputenv("__GL_SHADER_DISK_CACHE", "0");
}

} // namespace

void confineService(int socket)
{
    platform::keepOnlyDescriptor(socket);
    platform::endWithParent();
    platform::leaveNoCoreDump();
    if (qgetenv("FAVRIN_CONFINEMENT") == "off")
        return;
    keepNoShaders();
    using namespace std::chrono_literals;
    const auto patience = platform::defaultsfile::FolderLock::Clock::now() + 500ms;
    const auto result = platform::confine({
        .writableFolders = platform::defaultsfile::settle(platform::standardDefaultsFile(), patience),
        .writableDevices = {"/dev/null", "/dev/dri", "/dev/dxg", "/dev/nvidiactl", "/dev/nvidia0", "/dev/nvidia1",
                            "/dev/nvidia-modeset", "/dev/nvidia-uvm", "/dev/nvidia-caps"},
    });
    if (!result.missing.empty())
        platform::Log("com.quenta.favrin.ColorPicker", "Confinement").debug("Not confined: " + result.missing);
}

} // namespace favrin::apps
