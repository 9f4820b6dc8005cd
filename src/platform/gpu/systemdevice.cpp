#include "platform/gpu/systemdevice.h"

#include "platform/gpu/cpu/cpudevice.h"
#include "platform/gpu/gpulog.h"
#include "platform/gpu/vulkan/vulkandevice.h"
#include "platform/queue/queue.h"

#include <QDir>

namespace favrin::platform::gpu {
namespace {

/** Whether the kernel offers a GPU at all; looked up in a few microseconds. */
bool systemShowsGpu()
{
    const QStringList renderNodes = {QStringLiteral("renderD*")};
    return !QDir(QStringLiteral("/dev/dri")).entryList(renderNodes, QDir::System).isEmpty() ||
           QFile::exists(QStringLiteral("/dev/nvidia0")) || QFile::exists(QStringLiteral("/dev/dxg"));
}

} // namespace

DevicePolicy devicePolicy(const QByteArray &setting, bool systemShowsGpu)
{
    if (setting == "processor")
        return DevicePolicy::ProcessorOnly;
    if (setting == "hardware")
        return DevicePolicy::Hardware;
    if (setting == "vulkan")
        return DevicePolicy::AnyVulkanDevice;
    return systemShowsGpu ? DevicePolicy::Hardware : DevicePolicy::ProcessorOnly;
}

SystemDevice::SystemDevice() : m_processor(std::make_shared<cpu::CpuDevice>()), m_device(m_processor) {}

SystemDevice &SystemDevice::instance()
{
    // Never destroyed: a device may still be on its way when the process ends.
    static auto *const device = new SystemDevice;
    return *device;
}

std::shared_ptr<Device> SystemDevice::device()
{
    if (!m_searched) {
        m_searched = true;
        search();
    }
    return m_device;
}

void SystemDevice::search()
{
    const DevicePolicy policy = devicePolicy(qgetenv("FAVRIN_GPU"), systemShowsGpu());
    if (policy == DevicePolicy::ProcessorOnly)
        return;
    vulkan::VulkanOptions options;
    options.choice =
        policy == DevicePolicy::AnyVulkanDevice ? vulkan::DeviceChoice::AnyDevice : vulkan::DeviceChoice::HardwareOnly;
    backgroundQueue().async([options] {
        std::string reason;
        std::shared_ptr<Device> device = vulkan::VulkanDevice::create(options, &reason);
        if (!device)
            gpuLog().debug("The processor draws in place of a GPU: " + reason);
        mainQueue().async([device = std::move(device)]() mutable {
            if (device)
                SystemDevice::instance().adopt(std::move(device));
        });
    });
}

void SystemDevice::abandon(const std::shared_ptr<Device> &device)
{
    if (device && device == m_device && device != m_processor)
        adopt(m_processor);
}

void SystemDevice::adopt(std::shared_ptr<Device> device)
{
    m_device = std::move(device);
    Q_EMIT deviceChanged();
}

std::shared_ptr<Device> systemDefaultDevice()
{
    return SystemDevice::instance().device();
}

} // namespace favrin::platform::gpu
