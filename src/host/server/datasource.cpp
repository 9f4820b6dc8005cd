#include "host/server/datasource.h"

#include "host/server/connection.h"
#include "host/server/serverlimits.h"
#include "remote/limits.h"
#include "remote/wiretext.h"

#include <algorithm>

#include <wayland-server-protocol.h>

namespace favrin::host::server {

const void *DataSource::requests()
{
    static const struct wl_data_source_interface table = [] {
        struct wl_data_source_interface requests = {};
        requests.offer = [](wl_client *, wl_resource *r, const char *mimeType) {
            Resource::of<DataSource>(r)->offer(mimeType);
        };
        requests.destroy = destroyRequest;
        requests.set_actions = [](wl_client *, wl_resource *, std::uint32_t) {};
        return requests;
    }();
    return &table;
}

DataSource::DataSource(wl_resource *handle, Connection &connection)
    : Resource(handle, requests()), m_connection(connection)
{
}

bool DataSource::offers(const std::string &mimeType) const
{
    return std::ranges::find(m_mimeTypes, mimeType) != m_mimeTypes.end();
}

void DataSource::offer(const char *mimeType)
{
    // A type that no host could ask for is not worth a connection.
    if (!remote::isWireText(mimeType, remote::limits::textBytes) || offers(mimeType))
        return;
    if (m_mimeTypes.size() == limits::mimeTypes)
        m_connection.limitExceeded("more than " + std::to_string(limits::mimeTypes) + " types of one clipboard offer");
    else
        m_mimeTypes.emplace_back(mimeType);
}

} // namespace favrin::host::server
