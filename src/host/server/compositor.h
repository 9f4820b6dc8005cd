#pragma once

#include "host/server/resource.h"

#include <vector>

namespace favrin::host::server {

class Connection;
class Surface;

/** wl_compositor: makes surfaces and regions, and knows all surfaces. */
class Compositor
{
public:
    explicit Compositor(Connection &connection);

    Connection &connection() { return m_connection; }
    /** Lets go of what no one looks at: the buffers and frame callbacks of all surfaces but @p shown, which may be
     * null. */
    void settleAllBut(const Surface *shown);

    void surfaceWasMade(Surface &surface) { m_surfaces.push_back(&surface); }
    void surfaceWillGo(Surface &surface) { std::erase(m_surfaces, &surface); }

private:
    static const void *requests();
    void bind(wl_client *client, int version, std::uint32_t id);

    Connection &m_connection;
    ResourceList m_resources;
    std::vector<Surface *> m_surfaces;
};

} // namespace favrin::host::server
