#pragma once

#include "host/server/resource.h"

#include <functional>

namespace favrin::host::server {

class Connection;

/** wl_output: a screen as large as a surface may be, which tells the scale to draw with. */
class Output
{
public:
    Output(Connection &connection, int scale, std::function<void()> onBound);

    int scale() const { return m_scale; }
    bool isBound() const { return !m_resources.isEmpty(); }
    /** Only before it is bound. */
    void setScale(int scale) { m_scale = scale; }

    /** Tells the service that @p surface is on this screen, or is no longer. */
    void enter(wl_resource *surface);
    void leave(wl_resource *surface);

private:
    static const void *requests();
    void bind(wl_client *client, int version, std::uint32_t id);
    void describe(wl_resource *output);

    Connection &m_connection;
    ResourceList m_resources;
    int m_scale;
    std::function<void()> m_onBound;
};

} // namespace favrin::host::server
