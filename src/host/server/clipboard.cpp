#include "host/server/clipboard.h"

#include "host/server/connection.h"
#include "host/server/dataoffer.h"
#include "host/server/datasource.h"
#include "host/server/serverlimits.h"
#include "host/server/surface.h"
#include "remote/limits.h"
#include "remote/wiretext.h"

#include <algorithm>

#include <unistd.h>
#include <wayland-server-protocol.h>

namespace favrin::host::server {

namespace {

constexpr int offeredVersion = 3;

Clipboard &clipboardOf(wl_resource *resource)
{
    return *static_cast<Clipboard *>(wl_resource_get_user_data(resource));
}

} // namespace

const void *Clipboard::managerRequests()
{
    static const struct wl_data_device_manager_interface table = [] {
        struct wl_data_device_manager_interface requests = {};
        requests.create_data_source = [](wl_client *client, wl_resource *r, std::uint32_t id) {
            makeResource<DataSource>(client, wl_data_source_interface, wl_resource_get_version(r), id,
                                     clipboardOf(r).connection());
        };
        requests.get_data_device = [](wl_client *client, wl_resource *r, std::uint32_t id, wl_resource *) {
            clipboardOf(r).makeDevice(client, wl_resource_get_version(r), id);
        };
        return requests;
    }();
    return &table;
}

const void *Clipboard::deviceRequests()
{
    static const struct wl_data_device_interface table = [] {
        struct wl_data_device_interface requests = {};
        requests.start_drag = [](wl_client *, wl_resource *r, wl_resource *source, wl_resource *, wl_resource *icon,
                                 std::uint32_t) { clipboardOf(r).startDrag(r, source, icon); };
        requests.set_selection = [](wl_client *, wl_resource *r, wl_resource *source, std::uint32_t serial) {
            clipboardOf(r).setSelection(source, serial);
        };
        requests.release = destroyRequest;
        return requests;
    }();
    return &table;
}

Clipboard::Clipboard(Connection &connection) : m_connection(connection)
{
    offerGlobal<&Clipboard::bind>(connection.display(), wl_data_device_manager_interface, offeredVersion, this);
}

void Clipboard::bind(wl_client *client, int version, std::uint32_t id)
{
    m_managers.add(client, wl_data_device_manager_interface, version, id, managerRequests(), this);
}

void Clipboard::makeDevice(wl_client *client, int version, std::uint32_t id)
{
    if (wl_resource *device = m_devices.add(client, wl_data_device_interface, version, id, deviceRequests(), this))
        sendOffer(device);
}

void Clipboard::setHostTypes(const std::vector<std::string> &mimeTypes)
{
    m_hostTypes.clear();
    for (const std::string &type : mimeTypes) {
        if (m_hostTypes.size() < limits::mimeTypes && !type.empty() &&
            remote::isWireText(type, remote::limits::textBytes))
            m_hostTypes.push_back(type);
    }
    dropServiceSource();
    m_isOfferWaiting = true;
    settle();
}

void Clipboard::settle()
{
    if (!m_isOfferWaiting || m_offerCount >= limits::clipboardOffers || !m_connection.hasRoomForMotion())
        return;
    m_isOfferWaiting = false;
    m_devices.forEach([this](wl_resource *device) { sendOffer(device); });
}

bool Clipboard::hostOffers(const std::string &mimeType) const
{
    return std::ranges::find(m_hostTypes, mimeType) != m_hostTypes.end();
}

void Clipboard::offerWillGo()
{
    --m_offerCount;
}

void Clipboard::requestServiceData(const std::string &mimeType, int descriptor)
{
    const auto *source = m_serviceSource.as<DataSource>();
    if (source && source->offers(mimeType) && m_connection.admitsEvent())
        wl_data_source_send_send(source->handle(), mimeType.c_str(), descriptor);
    ::close(descriptor);
}

void Clipboard::startDrag(wl_resource *device, wl_resource *source, wl_resource *icon)
{
    if (icon && !Resource::of<Surface>(icon)->takeRole(SurfaceRole::DragIcon)) {
        wl_resource_post_error(device, WL_DATA_DEVICE_ERROR_ROLE, "the surface has another role");
        return;
    }
    if (source && m_connection.admitsEvent())
        wl_data_source_send_cancelled(source);
}

void Clipboard::setSelection(wl_resource *source, std::uint32_t serial)
{
    // Only what the user did in the picker may replace the user's clipboard.
    if (!m_connection.isRecentInput(serial)) {
        if (source && m_connection.admitsEvent())
            wl_data_source_send_cancelled(source);
        return;
    }
    const bool hadSource = m_serviceSource.get();
    if (source != m_serviceSource.get())
        dropServiceSource();
    m_serviceSource.reset(source);
    if (source)
        m_connection.delegate().serviceDidOfferClipboard(Resource::of<DataSource>(source)->mimeTypes());
    else if (hadSource)
        m_connection.delegate().serviceDidOfferClipboard({});
}

void Clipboard::dropServiceSource()
{
    if (m_serviceSource.get() && m_connection.admitsEvent())
        wl_data_source_send_cancelled(m_serviceSource.get());
    m_serviceSource.reset();
}

void Clipboard::sendOffer(wl_resource *device)
{
    if (!m_connection.admitsEvent())
        return;
    if (m_hostTypes.empty()) {
        wl_data_device_send_selection(device, nullptr);
        return;
    }
    auto *offer = makeResource<DataOffer>(wl_resource_get_client(device), wl_data_offer_interface,
                                          wl_resource_get_version(device), 0, *this);
    if (!offer)
        return;
    ++m_offerCount;
    wl_data_device_send_data_offer(device, offer->handle());
    for (const std::string &type : m_hostTypes)
        wl_data_offer_send_offer(offer->handle(), type.c_str());
    wl_data_device_send_selection(device, offer->handle());
}

} // namespace favrin::host::server
