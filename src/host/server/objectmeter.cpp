#include "host/server/objectmeter.h"

#include <algorithm>
#include <string_view>

namespace favrin::host::server {

namespace {

std::size_t kindOf(std::string_view interface)
{
    const auto found = std::ranges::find(limits::objects, interface, &limits::ObjectLimit::interface);
    return static_cast<std::size_t>(found - limits::objects.begin());
}

std::size_t limitOf(std::size_t kind)
{
    return kind < limits::objects.size() ? limits::objects[kind].count : limits::objectsOfOtherKinds;
}

} // namespace

/** Rides on an object and is deleted with it. */
struct ObjectMeter::Tally : wl_listener
{
    std::size_t *count = nullptr;

    static void resourceGoes(wl_listener *listener, void *)
    {
        auto *tally = static_cast<Tally *>(listener);
        --*tally->count;
        delete tally;
    }
};

ObjectMeter::ObjectMeter(Complaint complaint) : m_complaint(std::move(complaint))
{
    m_listener.notify = resourceCreated;
}

void ObjectMeter::watch(wl_client *client)
{
    wl_client_add_resource_created_listener(client, &m_listener);
}

void ObjectMeter::resourceCreated(wl_listener *listener, void *data)
{
    static_cast<Listener *>(listener)->owner->count(static_cast<wl_resource *>(data));
}

void ObjectMeter::count(wl_resource *resource)
{
    const std::string_view interface = wl_resource_get_class(resource);
    const std::size_t kind = kindOf(interface);
    auto *tally = new Tally{{}, &m_counts[kind]};
    tally->notify = Tally::resourceGoes;
    wl_resource_add_destroy_listener(resource, tally);
    if (++m_counts[kind] > limitOf(kind))
        m_complaint("more than " + std::to_string(limitOf(kind)) + " objects, the last of " + std::string(interface));
}

} // namespace favrin::host::server
