#include "host/server/remoteview.h"

#include "favrin-remote-view-v1-server-protocol.h"
#include "host/server/connection.h"
#include "host/server/remoteviewmessages.h"
#include "host/server/serverlimits.h"
#include "remote/limits.h"
#include "remote/sanitized.h"
#include "remote/wirecolor.h"
#include "remote/wiretext.h"

#include <algorithm>
#include <utility>

namespace favrin::host::server {

namespace {

constexpr int offeredVersion = 1;
/** What any message without a list may have, generously. */
constexpr std::size_t plainMessageBytes = 4096;

RemoteView &viewOf(wl_resource *resource)
{
    return *static_cast<RemoteView *>(wl_resource_get_user_data(resource));
}

bool isSize(double points)
{
    return points >= 0.0 && points <= remote::limits::largestSize;
}

} // namespace

const void *RemoteView::requests()
{
    static const struct favrin_remote_view_v1_interface table = [] {
        struct favrin_remote_view_v1_interface requests = {};
        requests.destroy = destroyRequest;
        requests.ready = [](wl_client *, wl_resource *r) { viewOf(r).serviceIsReady(); };
        requests.prepared = [](wl_client *, wl_resource *r, std::uint32_t serial) {
            viewOf(r).serviceDidPrepare(serial);
        };
        requests.picker_did_select_color = [](wl_client *, wl_resource *r, wl_array *color, const char *space,
                                              const char *colorspace, std::uint32_t isVolatile) {
            viewOf(r).pickerDidSelectColor(*color, space, colorspace, isVolatile);
        };
        requests.picker_did_show_eyedropper = [](wl_client *, wl_resource *r) {
            viewOf(r).m_connection.delegate().pickerDidShowEyedropper();
        };
        requests.picker_did_float_eyedropper = [](wl_client *, wl_resource *r) {
            viewOf(r).m_connection.delegate().pickerDidFloatEyedropper();
        };
        requests.picker_did_dismiss_eyedropper = [](wl_client *, wl_resource *r) {
            viewOf(r).m_connection.delegate().pickerDidDismissEyedropper();
        };
        requests.color_picker_did_finish = [](wl_client *, wl_resource *r) {
            viewOf(r).m_connection.delegate().colorPickerDidFinish();
        };
        requests.set_preferred_content_size = [](wl_client *, wl_resource *r, wl_fixed_t width, wl_fixed_t height) {
            viewOf(r).preferredContentSizeDidChange(wl_fixed_to_double(width), wl_fixed_to_double(height));
        };
        requests.set_background_effect = [](wl_client *, wl_resource *r, std::uint32_t effect) {
            viewOf(r).backgroundEffectDidChange(effect);
        };
        requests.focus_did_leave = [](wl_client *, wl_resource *r, std::uint32_t direction) {
            viewOf(r).focusDidLeave(direction);
        };
        return requests;
    }();
    return &table;
}

RemoteView::RemoteView(Connection &connection) : m_connection(connection)
{
    offerGlobal<&RemoteView::bind>(connection.display(), favrin_remote_view_v1_interface, offeredVersion, this);
}

void RemoteView::bind(wl_client *client, int version, std::uint32_t id)
{
    wl_resource *view = wl_resource_create(client, &favrin_remote_view_v1_interface, version, id);
    if (!view) {
        wl_client_post_no_memory(client);
        return;
    }
    wl_resource_set_implementation(view, requests(), this, nullptr);
    if (std::exchange(m_wasBound, true)) {
        wl_resource_post_error(view, FAVRIN_REMOTE_VIEW_V1_ERROR_ALREADY_BOUND, "bound a second time");
        return;
    }
    m_view.reset(view);
    m_connection.setLimitObject(view);
    settle();
}

bool RemoteView::canSend() const
{
    return m_view.get() && m_connection.hasRoomFor(plainMessageBytes);
}

void RemoteView::sendTraits(const remote::Traits &traits)
{
    m_waiting.traits = remote::sanitized(traits);
    if (*m_waiting.traits != traits)
        warn("traits were made sane before they were sent");
    settle();
}

void RemoteView::sendConfiguration(const remote::Configuration &configuration)
{
    m_waiting.configuration = remote::sanitized(configuration);
    if (*m_waiting.configuration != configuration)
        warn("a configuration was cut or made sane before it was sent");
    settle();
}

void RemoteView::sendSelectedColor(const std::optional<platform::Color> &color,
                                   const std::optional<std::string> &colorspace)
{
    if (color && !remote::isFinite(*color)) {
        warn("a selected color with a number that is not finite was not sent");
        return;
    }
    m_waiting.color = SelectedColor{color, colorspace};
    settle();
}

void RemoteView::sendPrepareForDisplay(std::uint32_t serial)
{
    if (m_waiting.preparations.size() + m_openPreparations.size() >= limits::openPreparations) {
        warn("too many preparations are open; one was not sent");
        return;
    }
    m_waiting.preparations.push_back(serial);
    settle();
}

void RemoteView::sendPresent()
{
    m_waiting.present = true;
    settle();
}

void RemoteView::sendFocusWillEnter(remote::FocusDirection direction)
{
    if (canSend())
        favrin_remote_view_v1_send_focus_will_enter(m_view.get(), static_cast<std::uint32_t>(direction));
}

void RemoteView::sendColorPickerDidFinish()
{
    m_waiting.finish = true;
    settle();
}

void RemoteView::settle()
{
    if (m_waiting.traits && canSend())
        postTraits(m_view.get(), *std::exchange(m_waiting.traits, std::nullopt));
    if (m_waiting.configuration && canSend()) {
        const ConfigurationMessages messages(*m_waiting.configuration);
        if (!m_connection.hasRoomFor(messages.bytes()))
            return;
        messages.post(m_view.get());
        m_waiting.configuration.reset();
    }
    if (m_waiting.color && canSend()) {
        const auto sent = *std::exchange(m_waiting.color, std::nullopt);
        postSelectedColor(m_view.get(), sent.color, sent.colorspace);
    }
    if (!canSend())
        return;
    for (const std::uint32_t serial : std::exchange(m_waiting.preparations, {})) {
        m_openPreparations.push_back(serial);
        favrin_remote_view_v1_send_prepare_for_display(m_view.get(), serial);
    }
    if (std::exchange(m_waiting.present, false))
        favrin_remote_view_v1_send_present(m_view.get());
    if (std::exchange(m_waiting.finish, false))
        favrin_remote_view_v1_send_color_picker_did_finish(m_view.get());
}

void RemoteView::serviceIsReady()
{
    if (std::exchange(m_wasReady, true))
        wl_resource_post_error(m_view.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_UNEXPECTED, "ready a second time");
    else
        m_connection.delegate().serviceIsReady();
}

void RemoteView::serviceDidPrepare(std::uint32_t serial)
{
    const auto found = std::ranges::find(m_openPreparations, serial);
    if (found == m_openPreparations.end()) {
        wl_resource_post_error(m_view.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_UNEXPECTED, "serial %u is not open", serial);
        return;
    }
    m_openPreparations.erase(found);
    m_connection.delegate().serviceDidPrepare(serial);
}

void RemoteView::pickerDidSelectColor(const wl_array &array, const char *space, const char *colorspace,
                                      std::uint32_t isVolatile)
{
    if (!checkText(space) || !checkText(colorspace))
        return;
    if (isVolatile > 1) {
        wl_resource_post_error(m_view.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_INVALID_VALUE, "is_volatile is %u",
                               isVolatile);
        return;
    }
    const std::span bytes(static_cast<const std::byte *>(array.data), array.size);
    const auto color = remote::decodeColor(bytes, space ? std::optional<std::string_view>(space) : std::nullopt);
    if (!color) {
        wl_resource_post_error(m_view.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_INVALID_COLOR, "not a color of its space");
        return;
    }
    m_connection.delegate().pickerDidSelectColor(
        *color, colorspace ? std::optional<std::string>(colorspace) : std::nullopt, isVolatile == 1);
}

void RemoteView::preferredContentSizeDidChange(double width, double height)
{
    if (isSize(width) && isSize(height))
        m_connection.delegate().preferredContentSizeDidChange(width, height);
    else
        wl_resource_post_error(m_view.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_INVALID_SIZE, "%g by %g points", width,
                               height);
}

void RemoteView::backgroundEffectDidChange(std::uint32_t effect)
{
    if (effect <= FAVRIN_REMOTE_VIEW_V1_BACKGROUND_EFFECT_THICK_MATERIAL)
        m_connection.delegate().backgroundEffectDidChange(static_cast<remote::BackgroundEffect>(effect));
    else
        wl_resource_post_error(m_view.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_INVALID_VALUE, "background effect %u", effect);
}

void RemoteView::focusDidLeave(std::uint32_t direction)
{
    if (direction <= FAVRIN_REMOTE_VIEW_V1_FOCUS_DIRECTION_BACKWARD)
        m_connection.delegate().focusDidLeave(static_cast<remote::FocusDirection>(direction));
    else
        wl_resource_post_error(m_view.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_INVALID_VALUE, "focus direction %u",
                               direction);
}

bool RemoteView::checkText(const char *text)
{
    if (!text || remote::isWireText(text, remote::limits::textBytes))
        return true;
    wl_resource_post_error(m_view.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_INVALID_TEXT, "too long or not UTF-8");
    return false;
}

void RemoteView::warn(const std::string &message)
{
    m_connection.delegate().serverDidWarn(message);
}

} // namespace favrin::host::server
