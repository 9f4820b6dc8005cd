#pragma once

#include "host/server/remoteviewserver.h"

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
    void surfaceDidUnmap() override { calls.push_back("unmap"); }
    void serviceIsReady() override { calls.push_back("ready"); }
    void serviceDidPrepare(std::uint32_t serial) override { calls.push_back("prepared " + std::to_string(serial)); }
    void pickerDidSelectColor(const std::optional<favrin::platform::Color> &color,
                              const std::optional<std::string> &colorspace, bool isVolatile) override
    {
        picks.push_back({color, colorspace, isVolatile});
    }
    void pickerDidShowEyedropper() override { calls.push_back("show eyedropper"); }
    void pickerDidFloatEyedropper() override { calls.push_back("float eyedropper"); }
    void pickerDidDismissEyedropper() override { calls.push_back("dismiss eyedropper"); }
    void colorPickerDidFinish() override
    {
        calls.push_back("finish");
        if (closeOnFinish)
            closeOnFinish->closeConnection();
    }
    void preferredContentSizeDidChange(double width, double height) override
    {
        calls.push_back("size " + std::to_string(width) + " " + std::to_string(height));
    }
    void focusDidLeave(favrin::remote::FocusDirection direction) override
    {
        calls.push_back("leave " + std::to_string(static_cast<int>(direction)));
    }
    void backgroundEffectDidChange(favrin::remote::BackgroundEffect effect) override
    {
        calls.push_back("effect " + std::to_string(static_cast<int>(effect)));
    }
    void textInputDidChange(const favrin::host::server::TextInputState &state) override { textInputs.push_back(state); }
    void serviceDidOfferClipboard(const std::vector<std::string> &mimeTypes) override { offers.push_back(mimeTypes); }
    void serviceWantsClipboard(const std::string &mimeType, int descriptor) override
    {
        calls.push_back("wants " + mimeType);
        static_cast<void>(!::write(descriptor, "host", 4));
        ::close(descriptor);
    }
    void cursorDidChange(const std::string &name) override { calls.push_back("cursor " + name); }
    void serviceResponsivenessDidChange(bool responsive) override
    {
        calls.push_back(responsive ? "responsive" : "unresponsive");
    }
    void serverDidWarn(const std::string &message) override { warnings.push_back(message); }
    void connectionDidClose(favrin::host::server::CloseReason reason, const std::string &detail) override
    {
        closes.push_back({reason, detail});
    }

    std::vector<std::string> calls;
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
