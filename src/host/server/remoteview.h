#pragma once

#include "host/server/resource.h"
#include "remote/records.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace favrin::host::server {

class Connection;

/**
 * favrin_remote_view_v1: what picker and host say to each other.
 *
 * Messages wait here, the newest of each kind, while the service has not bound the extension or does not read.
 */
class RemoteView
{
public:
    explicit RemoteView(Connection &connection);

    void sendTraits(const remote::Traits &traits);
    void sendConfiguration(const remote::Configuration &configuration);
    void sendSelectedColor(const std::optional<platform::Color> &color, const std::optional<std::string> &colorspace);
    void sendPrepareForDisplay(std::uint32_t serial);
    void sendPresent();
    /** Not kept for later: a focus that moved on is not missed. */
    void sendFocusWillEnter(remote::FocusDirection direction);
    void sendColorPickerDidFinish();
    /** Sends what waits, as far as there is room: traits, configuration, color, prepare, present, finish. */
    void settle();

private:
    struct SelectedColor
    {
        std::optional<platform::Color> color;
        std::optional<std::string> colorspace;
    };
    struct Waiting
    {
        std::optional<remote::Traits> traits;
        std::optional<remote::Configuration> configuration;
        std::optional<SelectedColor> color;
        std::vector<std::uint32_t> preparations;
        bool present = false;
        bool finish = false;
    };

    static const void *requests();
    void bind(wl_client *client, int version, std::uint32_t id);
    bool canSend() const;

    void serviceIsReady();
    void serviceDidPrepare(std::uint32_t serial);
    void pickerDidSelectColor(const wl_array &array, const char *space, const char *colorspace,
                              std::uint32_t isVolatile);
    void preferredContentSizeDidChange(double width, double height);
    void backgroundEffectDidChange(std::uint32_t effect);
    void focusDidLeave(std::uint32_t direction);
    bool checkText(const char *text);
    void warn(const std::string &message);

    Connection &m_connection;
    WeakResource m_view;
    Waiting m_waiting;
    /** Serials of prepare_for_display that were not answered yet. */
    std::vector<std::uint32_t> m_openPreparations;
    bool m_wasBound = false;
    bool m_wasReady = false;
};

} // namespace favrin::host::server
