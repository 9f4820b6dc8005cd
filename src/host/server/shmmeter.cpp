#include "host/server/shmmeter.h"

#include "host/server/serverlimits.h"

#include <string_view>
#include <utility>

#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

constexpr std::uint32_t createPoolRequest = 0;
constexpr std::uint32_t createBufferRequest = 0;
constexpr std::uint32_t resizePoolRequest = 2;

/** libwayland refuses sizes that are not positive by itself. */
std::size_t sizeArgument(std::int32_t size)
{
    return size > 0 ? static_cast<std::size_t>(size) : 0;
}

} // namespace

/** One mapping; gives its bytes back when the last object that keeps it mapped is gone. */
struct ShmMeter::Pool
{
    explicit Pool(std::size_t *meter) : total(meter) {}
    ~Pool() { *total -= bytes; }
    Pool(const Pool &) = delete;
    Pool &operator=(const Pool &) = delete;

    std::size_t *total;
    std::size_t bytes = 0;
};

/** Rides on a pool or buffer object and is deleted with it. */
struct ShmMeter::Holder : wl_listener
{
    std::shared_ptr<Pool> pool;
    ShmMeter *owner = nullptr;

    static void resourceGoes(wl_listener *listener, void *data)
    {
        auto *holder = static_cast<Holder *>(listener);
        auto *resource = static_cast<wl_resource *>(data);
        if (std::string_view(wl_resource_get_class(resource)) == wl_shm_pool_interface.name)
            holder->owner->m_pools.erase(wl_resource_get_id(resource));
        delete holder;
    }
};

ShmMeter::ShmMeter(Complaint complaint) : m_complaint(std::move(complaint))
{
    m_listener.notify = resourceCreated;
}

void ShmMeter::watch(wl_client *client)
{
    wl_client_add_resource_created_listener(client, &m_listener);
}

void ShmMeter::requestArrived(const wl_protocol_logger_message &message)
{
    const std::string_view interface = wl_resource_get_class(message.resource);
    const auto opcode = static_cast<std::uint32_t>(message.message_opcode);
    if (interface == wl_shm_interface.name && opcode == createPoolRequest) {
        m_next = std::make_shared<Pool>(&m_bytes);
        add(*m_next, sizeArgument(message.arguments[2].i));
        return;
    }
    if (interface != wl_shm_pool_interface.name)
        return;
    const auto found = m_pools.find(wl_resource_get_id(message.resource));
    const std::shared_ptr<Pool> pool = found == m_pools.end() ? nullptr : found->second.lock();
    if (opcode == createBufferRequest)
        m_next = pool;
    else if (opcode == resizePoolRequest && pool && sizeArgument(message.arguments[0].i) > pool->bytes)
        add(*pool, sizeArgument(message.arguments[0].i) - pool->bytes);
}

void ShmMeter::resourceCreated(wl_listener *listener, void *data)
{
    static_cast<Listener *>(listener)->owner->follow(static_cast<wl_resource *>(data));
}

void ShmMeter::follow(wl_resource *resource)
{
    const std::string_view interface = wl_resource_get_class(resource);
    const bool isPool = interface == wl_shm_pool_interface.name;
    if (!m_next || (!isPool && interface != wl_buffer_interface.name))
        return;
    auto *holder = new Holder{{}, std::exchange(m_next, nullptr), this};
    holder->notify = Holder::resourceGoes;
    wl_resource_add_destroy_listener(resource, holder);
    if (isPool)
        m_pools.insert_or_assign(wl_resource_get_id(resource), holder->pool);
}

void ShmMeter::add(Pool &pool, std::size_t bytes)
{
    pool.bytes += bytes;
    m_bytes += bytes;
    if (m_bytes > limits::sharedMemoryBytes)
        m_complaint("more than " + std::to_string(limits::sharedMemoryBytes) + " bytes of shared memory");
}

} // namespace favrin::host::server
