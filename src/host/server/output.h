#pragma once

#include "host/server/resource.h"

namespace favrin::host::server {

class Connection;

/** wl_output: the one screen that the service sees, as large as a surface may be. It tells the scale to draw with. */
class Output
{
public:
    explicit Output(Connection &connection);

    void setScale(int scale);
    /** Tells @p surface that it is on this screen. */
    void enter(wl_resource *surface);

private:
    static const void *requests();
    void bind(wl_client *client, int version, std::uint32_t id);
    void describe(wl_resource *output);

    Connection &m_connection;
    ResourceList m_resources;
    WeakResource m_surface;
    int m_scale = 1;
};

} // namespace favrin::host::server
