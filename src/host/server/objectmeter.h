#pragma once

#include "host/server/serverlimits.h"

#include <array>
#include <cstddef>
#include <functional>
#include <string>

#include <wayland-server-core.h>

namespace favrin::host::server {

/** Counts the client's live objects by interface, and complains when there are more than limits::objects allows. */
class ObjectMeter
{
public:
    using Complaint = std::function<void(const std::string &what)>;

    explicit ObjectMeter(Complaint complaint);
    void watch(wl_client *client);

private:
    struct Listener : wl_listener
    {
        ObjectMeter *owner = nullptr;
    };
    struct Tally;

    static void resourceCreated(wl_listener *listener, void *data);
    void count(wl_resource *resource);

    Complaint m_complaint;
    Listener m_listener = {{}, this};
    std::array<std::size_t, limits::objects.size() + 1> m_counts = {};
};

} // namespace favrin::host::server
