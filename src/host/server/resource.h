#pragma once

#include <cstdint>

#include <wayland-server-core.h>

namespace favrin::host::server {

/** A Wayland object with state of its own: made with its wl_resource, deleted with it. */
class Resource
{
public:
    Resource(const Resource &) = delete;
    Resource &operator=(const Resource &) = delete;

    wl_resource *handle() const { return m_handle; }
    wl_client *client() const { return wl_resource_get_client(m_handle); }
    std::uint32_t version() const { return static_cast<std::uint32_t>(wl_resource_get_version(m_handle)); }

    /** The object behind @p handle, which must have been made as a @p T, or null for null. */
    template<class T>
    static T *of(wl_resource *handle)
    {
        return handle ? static_cast<T *>(static_cast<Resource *>(wl_resource_get_user_data(handle))) : nullptr;
    }

protected:
    Resource(wl_resource *handle, const void *requests) : m_handle(handle)
    {
        wl_resource_set_implementation(handle, requests, this, [](wl_resource *dying) {
            delete static_cast<Resource *>(wl_resource_get_user_data(dying));
        });
    }
    virtual ~Resource() = default;

private:
    wl_resource *m_handle;
};

/** Makes the wl_resource and its object. Null, with the client told, when the client's id is wrong or memory is short.
 */
template<class T, class... Arguments>
T *makeResource(wl_client *client, const wl_interface &interface, int version, std::uint32_t id,
                Arguments &&...arguments)
{
    wl_resource *handle = wl_resource_create(client, &interface, version, id);
    if (!handle) {
        wl_client_post_no_memory(client);
        return nullptr;
    }
    return new T(handle, static_cast<Arguments &&>(arguments)...);
}

/** A borrowed wl_resource; null once it is destroyed. */
class WeakResource
{
public:
    WeakResource() { m_link.notify = forget; }
    ~WeakResource() { reset(); }
    WeakResource(const WeakResource &) = delete;
    WeakResource &operator=(const WeakResource &) = delete;

    void reset(wl_resource *resource = nullptr)
    {
        if (m_resource)
            wl_list_remove(&m_link.link);
        m_resource = resource;
        if (m_resource)
            wl_resource_add_destroy_listener(m_resource, &m_link);
    }
    wl_resource *get() const { return m_resource; }
    template<class T>
    T *as() const
    {
        return Resource::of<T>(m_resource);
    }

private:
    struct Link : wl_listener
    {
        WeakResource *owner = nullptr;
    };

    static void forget(wl_listener *listener, void *) { static_cast<Link *>(listener)->owner->reset(); }

    wl_resource *m_resource = nullptr;
    Link m_link = {{}, this};
};

/** The client's objects of one kind that need no state of their own. Must outlive the client. */
class ResourceList
{
public:
    ResourceList() { wl_list_init(&m_list); }
    ResourceList(const ResourceList &) = delete;
    ResourceList &operator=(const ResourceList &) = delete;

    wl_resource *add(wl_client *client, const wl_interface &interface, int version, std::uint32_t id,
                     const void *requests, void *data)
    {
        wl_resource *resource = wl_resource_create(client, &interface, version, id);
        if (!resource) {
            wl_client_post_no_memory(client);
            return nullptr;
        }
        wl_resource_set_implementation(resource, requests, data,
                                       [](wl_resource *dying) { wl_list_remove(wl_resource_get_link(dying)); });
        wl_list_insert(m_list.prev, wl_resource_get_link(resource));
        return resource;
    }

    bool isEmpty() const { return wl_list_empty(&m_list) != 0; }
    /** Moves all objects of @p other to the end of this list. */
    void takeAll(ResourceList &other)
    {
        wl_list_insert_list(m_list.prev, &other.m_list);
        wl_list_init(&other.m_list);
    }

    template<class Function>
    void forEach(Function &&function) const
    {
        for (wl_list *link = m_list.next, *next = link->next; link != &m_list; link = next, next = link->next)
            function(wl_resource_from_link(link));
    }

private:
    wl_list m_list;
};

/** The request that destroys its object and does nothing else. */
inline void destroyRequest(wl_client *, wl_resource *resource)
{
    wl_resource_destroy(resource);
}

/** Offers @p interface to the client; a bind ends in the member @p bind of @p owner. */
template<auto bind, class Owner>
void offerGlobal(wl_display *display, const wl_interface &interface, int version, Owner *owner)
{
    wl_global_create(display, &interface, version, owner,
                     [](wl_client *client, void *data, std::uint32_t boundVersion, std::uint32_t id) {
                         (static_cast<Owner *>(data)->*bind)(client, static_cast<int>(boundVersion), id);
                     });
}

} // namespace favrin::host::server
