#pragma once

#include "platform/gpu/device.h"

#include <QByteArray>
#include <QObject>

namespace favrin::platform::gpu {

/** What may draw on this machine. */
enum class DevicePolicy {
    /** The processor, without looking for anything else. */
    ProcessorOnly,
    /** A GPU where a driver offers one. */
    Hardware,
    /** Whatever Vulkan offers, drivers that draw by the processor included. */
    AnyVulkanDevice
};

/**
 * The rule. A Vulkan driver that draws by the processor costs tens of milliseconds and megabytes to start and is slower
 * than our own device for the processor, so it is used only when asked for; and where the system shows no GPU, no
 * driver is loaded just to hear so.
 * @param setting the value of the environment variable FAVRIN_GPU: "processor", "hardware" or "vulkan"; anything else
 * leaves the choice to @p systemShowsGpu
 */
DevicePolicy devicePolicy(const QByteArray &setting, bool systemShowsGpu);

/**
 * The device that this process draws with: the processor at first, so that the first picture waits for no driver, and a
 * GPU from the moment its driver, loaded in the background, is ready. Main thread only.
 */
class SystemDevice : public QObject
{
    Q_OBJECT

public:
    static SystemDevice &instance();

    /** Never null. The first call starts the search for a GPU. */
    std::shared_ptr<Device> device();
    /** Goes back to the processor when @p device, which failed, is the one in use. */
    void abandon(const std::shared_ptr<Device> &device);

Q_SIGNALS:
    /** device() is another one; who draws does so anew. */
    void deviceChanged();

private:
    SystemDevice();
    void search();
    void adopt(std::shared_ptr<Device> device);

    std::shared_ptr<Device> m_processor;
    std::shared_ptr<Device> m_device;
    bool m_searched = false;
};

/** The system's default device, as SystemDevice has it now. */
std::shared_ptr<Device> systemDefaultDevice();

} // namespace favrin::platform::gpu
