#pragma once

#include "host/server/resource.h"

namespace favrin::host::server {

class Clipboard;

/** wl_data_offer: the host's clipboard as the service was told of it. What is asked of an old one is answered with
 * today's. */
class DataOffer : public Resource
{
public:
    DataOffer(wl_resource *handle, Clipboard &clipboard);
    ~DataOffer() override;

private:
    static const void *requests();
    void receive(const char *mimeType, int descriptor);

    Clipboard &m_clipboard;
};

} // namespace favrin::host::server
