#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <unordered_map>

#include <wayland-server-core.h>

namespace favrin::host::server {

/**
 * Adds up the shared memory that the client has mapped into the host, and complains past limits::sharedMemoryBytes.
 *
 * A pool stays mapped until its last buffer is gone. libwayland owns pools and buffers, so this reads the sizes from
 * the requests as they pass and follows the objects that come of them.
 */
class ShmMeter
{
public:
    using Complaint = std::function<void(const std::string &what)>;

    explicit ShmMeter(Complaint complaint);
    void watch(wl_client *client);
    void requestArrived(const wl_protocol_logger_message &message);

private:
    struct Listener : wl_listener
    {
        ShmMeter *owner = nullptr;
    };
    struct Pool;
    struct Holder;

    static void resourceCreated(wl_listener *listener, void *data);
    void follow(wl_resource *resource);
    void add(Pool &pool, std::size_t bytes);

    Complaint m_complaint;
    Listener m_listener = {{}, this};
    std::size_t m_bytes = 0;
    std::unordered_map<std::uint32_t, std::weak_ptr<Pool>> m_pools;
    /** The pool that the object created next belongs to. */
    std::shared_ptr<Pool> m_next;
};

} // namespace favrin::host::server
