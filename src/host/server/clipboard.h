#pragma once

#include "host/server/resource.h"

#include <string>
#include <vector>

namespace favrin::host::server {

class Connection;
class DataSource;

/** wl_data_device_manager and wl_data_device: the clipboard of host and picker. Dragging is not carried. */
class Clipboard
{
public:
    explicit Clipboard(Connection &connection);

    /** The host's clipboard holds these types. It takes the place of what the service has offered. */
    void setHostTypes(const std::vector<std::string> &mimeTypes);
    /** The service writes its clipboard to @p descriptor, which is closed here. */
    void requestServiceData(const std::string &mimeType, int descriptor);
    /** Sends an offer that had to wait. */
    void settle();

    Connection &connection() { return m_connection; }
    bool hostOffers(const std::string &mimeType) const;
    void offerWillGo();

private:
    static const void *managerRequests();
    static const void *deviceRequests();
    void bind(wl_client *client, int version, std::uint32_t id);
    void makeDevice(wl_client *client, int version, std::uint32_t id);
    void startDrag(wl_resource *device, wl_resource *source, wl_resource *icon);
    void setSelection(wl_resource *source, std::uint32_t serial);
    void dropServiceSource();
    void sendOffer(wl_resource *device);

    Connection &m_connection;
    ResourceList m_managers;
    ResourceList m_devices;
    std::vector<std::string> m_hostTypes;
    WeakResource m_serviceSource;
    std::size_t m_offerCount = 0;
    bool m_isOfferWaiting = false;
};

} // namespace favrin::host::server
