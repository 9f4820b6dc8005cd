#pragma once

#include "host/server/resource.h"

namespace favrin::host::server {

/** wl_region: must exist for a client that describes itself; nobody asks what it holds. */
class Region : public Resource
{
public:
    explicit Region(wl_resource *handle);
};

} // namespace favrin::host::server
