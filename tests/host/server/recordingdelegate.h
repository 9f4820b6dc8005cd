#pragma once

#include "host/server/remoteviewserver.h"

#include <QStringList>

#include <functional>
#include <string>
#include <vector>

#include <unistd.h>

/** Keeps what the server tells, and answers nothing. */
class RecordingDelegate : public favrin::host::server::RemoteViewServerDelegate
{
public:
    struct Pick
    {
        std::optional<favrin::platform::Color> color;
        std::optional<std::string> colorspace;
        bool isVolatile = false;
        bool operator==(const Pick &) const = default;
    };
    struct ShownFrame
    {
        favrin::host::server::Frame frame;
        std::vector<std::uint32_t> pixels;
    };
    struct Close
    {
        favrin::host::server::CloseReason reason;
        std::string detail;
    };

    void frameDidArrive(const favrin::host::server::Frame &frame) override
    {
        ShownFrame shown{frame, {}};
        for (int y = 0; y < frame.height; ++y) {
            const auto *row = reinterpret_cast<const std::uint32_t *>(frame.pixels + std::ptrdiff_t(y) * frame.stride);
            shown.pixels.insert(shown.pixels.end(), row, row + frame.width);
        }
        frames.push_back(std::move(shown));
        if (onFrame)
            onFrame();
    }
    void surfaceDidUnmap() override { calls << QStringLiteral("unmap"); }
    void serviceIsReady() override { calls << QStringLiteral("ready"); }
    void serviceDidPrepare(std::uint32_t serial) override { calls << QStringLiteral("prepared %1").arg(serial); }
    void pickerDidSelectColor(const std::optional<favrin::platform::Color> &color,
                              const std::optional<std::string> &colorspace, bool isVolatile) override
    {
        picks.push_back({color, colorspace, isVolatile});
    }
    void pickerDidShowEyedropper() override { calls << QStringLiteral("show eyedropper"); }
    void pickerDidFloatEyedropper() override { calls << QStringLiteral("float eyedropper"); }
    void pickerDidDismissEyedropper() override { calls << QStringLiteral("dismiss eyedropper"); }
    void colorPickerDidFinish() override
    {
        calls << QStringLiteral("finish");
        if (closeOnFinish)
            closeOnFinish->closeConnection();
    }
    void preferredContentSizeDidChange(double width, double height) override
    {
        calls << QStringLiteral("size %1 %2").arg(width).arg(height);
    }
    void focusDidLeave(favrin::remote::FocusDirection direction) override
    {
        calls << QStringLiteral("leave %1").arg(static_cast<int>(direction));
    }
    void backgroundEffectDidChange(favrin::remote::BackgroundEffect effect) override
    {
        calls << QStringLiteral("effect %1").arg(static_cast<int>(effect));
    }
    void textInputDidChange(const favrin::host::server::TextInputState &state) override { textInputs.push_back(state); }
    void serviceDidOfferClipboard(const std::vector<std::string> &mimeTypes) override { offers.push_back(mimeTypes); }
    void serviceWantsClipboard(const std::string &mimeType, int descriptor) override
    {
        calls << QStringLiteral("wants ") + QString::fromStdString(mimeType);
        static_cast<void>(!::write(descriptor, "host", 4));
        ::close(descriptor);
    }
    void cursorDidChange(const std::string &name) override
    {
        calls << QStringLiteral("cursor ") + QString::fromStdString(name);
    }
    void serviceResponsivenessDidChange(bool responsive) override
    {
        calls << (responsive ? QStringLiteral("responsive") : QStringLiteral("unresponsive"));
    }
    void serverDidWarn(const std::string &message) override { warnings.push_back(message); }
    void connectionDidClose(favrin::host::server::CloseReason reason, const std::string &detail) override
    {
        closes.push_back({reason, detail});
    }

    /** Whether the end was told, once, with this reason. */
    bool isClosedFor(favrin::host::server::CloseReason reason) const
    {
        return closes.size() == 1 && closes[0].reason == reason;
    }

    QStringList calls;
    std::vector<ShownFrame> frames;
    std::vector<Pick> picks;
    std::vector<favrin::host::server::TextInputState> textInputs;
    std::vector<std::vector<std::string>> offers;
    std::vector<std::string> warnings;
    std::vector<Close> closes;
    /** What the host does when it hears of a frame, if anything. */
    std::function<void()> onFrame;
    /** The server to close when the picker finishes, if any. */
    favrin::host::server::RemoteViewServer *closeOnFinish = nullptr;
};
