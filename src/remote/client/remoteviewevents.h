#pragma once

#include "remote/records.h"

#include <optional>
#include <string>

struct favrin_remote_view_v1;
struct favrin_remote_view_v1_listener;

namespace favrin::remote::client {

/** Takes whole records and messages, put together from the events of the wire and made sane. */
class RemoteViewEventsReceiver
{
public:
    virtual ~RemoteViewEventsReceiver() = default;
    virtual void traitsDidArrive(const Traits &traits) = 0;
    virtual void configurationDidArrive(const Configuration &configuration) = 0;
    virtual void selectedColorDidArrive(const std::optional<platform::Color> &color,
                                        const std::optional<std::string> &colorspace) = 0;
    virtual void prepareForDisplayDidArrive(std::uint32_t serial) = 0;
    virtual void presentDidArrive() = 0;
    virtual void focusWillEnterDidArrive(FocusDirection direction) = 0;
    virtual void colorPickerDidFinishDidArrive() = 0;
};

/**
 * Collects the events of favrin_remote_view_v1 into records. Trait and configuration events change a pending record,
 * which takes effect with its closing event. Traits that are not sent again keep their values; a configuration starts
 * from the defaults each time.
 */
class RemoteViewEvents
{
public:
    explicit RemoteViewEvents(RemoteViewEventsReceiver &receiver);

    /** The listener of the wire; its data is a RemoteViewEvents. */
    static const favrin_remote_view_v1_listener &listener();

private:
    struct Handlers;
    void finishConfiguration();

    RemoteViewEventsReceiver &m_receiver;
    Traits m_traits;
    Configuration m_configuration;
    std::string m_title;
    std::vector<platform::Color> m_suggestedColors;
};

} // namespace favrin::remote::client
