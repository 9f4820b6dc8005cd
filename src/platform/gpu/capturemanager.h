#pragma once

#include "platform/gpu/renderpass.h"

#include <QString>

namespace favrin::platform::gpu {

class Device;

struct CaptureDescriptor
{
    /** The device whose frames are captured. */
    std::shared_ptr<Device> captureObject;
    /** Where the files go; must exist. */
    QString outputFolder;
};

/** One frame to be captured: what was encoded for it, and where it is written. */
class FrameCapture
{
public:
    FrameCapture(QString pathWithoutSuffix, const Device &device, const std::vector<RenderPass> &passes);

    /** Writes the commands as JSON and the picture as PNG. */
    void write(const QImage &image) const;

private:
    QString m_path;
    QByteArray m_commands;
};

/**
 * Captures frames of a device to files for debugging: frame-1.json with the commands and frame-1.png with the picture,
 * and so on. A frame counts when it is committed while the capture runs. Main thread only.
 */
class CaptureManager
{
public:
    static CaptureManager &shared();

    /** Starts a capture; false when one is running already or the description names no device. */
    bool startCapture(CaptureDescriptor descriptor);
    void stopCapture();
    bool isCapturing() const { return m_descriptor.captureObject != nullptr; }

    /** For a command buffer being committed: the capture of its frame, or null. */
    std::shared_ptr<FrameCapture> frameCapture(const Device &device, const std::vector<RenderPass> &passes);

private:
    CaptureDescriptor m_descriptor;
    int m_frames = 0;
};

} // namespace favrin::platform::gpu
