#pragma once

#include "host/server/resource.h"

#include <string>
#include <vector>

namespace favrin::host::server {

class Connection;

/** wl_data_source: what the service has to give, by its types. */
class DataSource : public Resource
{
public:
    DataSource(wl_resource *handle, Connection &connection);

    const std::vector<std::string> &mimeTypes() const { return m_mimeTypes; }
    bool offers(const std::string &mimeType) const;

private:
    static const void *requests();
    void offer(const char *mimeType);

    Connection &m_connection;
    std::vector<std::string> m_mimeTypes;
};

} // namespace favrin::host::server
