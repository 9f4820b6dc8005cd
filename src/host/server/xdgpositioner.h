#pragma once

#include "host/server/resource.h"

namespace favrin::host::server {

/** xdg_positioner: needed to ask for a popup; as popups are dismissed at once, it only checks what it is told. */
class XdgPositioner : public Resource
{
public:
    explicit XdgPositioner(wl_resource *handle);

private:
    static const void *requests();
};

} // namespace favrin::host::server
