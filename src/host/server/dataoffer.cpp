#include "host/server/dataoffer.h"

#include "host/server/clipboard.h"
#include "host/server/connection.h"

#include <unistd.h>
#include <wayland-server-protocol.h>

namespace favrin::host::server {

const void *DataOffer::requests()
{
    static const struct wl_data_offer_interface table = [] {
        struct wl_data_offer_interface requests = {};
        requests.accept = [](wl_client *, wl_resource *, std::uint32_t, const char *) {};
        requests.receive = [](wl_client *, wl_resource *r, const char *mimeType, std::int32_t descriptor) {
            Resource::of<DataOffer>(r)->receive(mimeType, descriptor);
        };
        requests.destroy = destroyRequest;
        requests.finish = [](wl_client *, wl_resource *) {};
        requests.set_actions = [](wl_client *, wl_resource *, std::uint32_t, std::uint32_t) {};
        return requests;
    }();
    return &table;
}

DataOffer::DataOffer(wl_resource *handle, Clipboard &clipboard) : Resource(handle, requests()), m_clipboard(clipboard)
{
}

DataOffer::~DataOffer()
{
    m_clipboard.offerWillGo();
}

void DataOffer::receive(const char *mimeType, int descriptor)
{
    if (m_clipboard.hostOffers(mimeType))
        m_clipboard.connection().delegate().serviceWantsClipboard(mimeType, descriptor);
    else
        ::close(descriptor);
}

} // namespace favrin::host::server
