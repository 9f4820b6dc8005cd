#include "remote/client/remoteviewconnection.h"

#include "favrin-remote-view-v1-client-protocol.h"
#include "remote/client/remoteviewevents.h"
#include "remote/wirecolor.h"

#include <cstring>
#include <functional>
#include <thread>
#include <utility>
#include <vector>

namespace favrin::remote::client {

namespace {

const char *wireText(const std::optional<std::string> &text)
{
    return text ? text->c_str() : nullptr;
}

} // namespace

struct RemoteViewConnection::Private : RemoteViewEventsReceiver
{
    Private(wl_display *wlDisplay, RemoteViewConnectionDelegate &connectionDelegate)
        : display(wlDisplay), delegate(connectionDelegate), events(*this)
    {
    }

    wl_display *display;
    RemoteViewConnectionDelegate &delegate;
    RemoteViewEvents events;
    wl_registry *registry = nullptr;
    wl_callback *globals = nullptr;
    favrin_remote_view_v1 *view = nullptr;
    bool readySent = false;
    bool delivers = false;
    std::vector<std::function<void()>> waiting;

    void deliver(std::function<void()> event)
    {
        if (delivers)
            event();
        else
            waiting.push_back(std::move(event));
    }

    static void global(void *data, wl_registry *registry, uint32_t name, const char *interface, uint32_t)
    {
        auto *self = static_cast<Private *>(data);
        if (self->view || std::strcmp(interface, favrin_remote_view_v1_interface.name) != 0)
            return;
        self->view =
            static_cast<favrin_remote_view_v1 *>(wl_registry_bind(registry, name, &favrin_remote_view_v1_interface, 1));
        favrin_remote_view_v1_add_listener(self->view, &RemoteViewEvents::listener(), &self->events);
    }
    static void globalRemove(void *, wl_registry *, uint32_t) {}
    static void globalsDidArrive(void *data, wl_callback *callback, uint32_t)
    {
        auto *self = static_cast<Private *>(data);
        wl_callback_destroy(callback);
        self->globals = nullptr;
        if (!self->view)
            self->delegate.hostIsMissing();
    }

    void flush() const { wl_display_flush(display); }

    void traitsDidArrive(const Traits &traits) override { delegate.traitsDidChange(traits); }
    void configurationDidArrive(const Configuration &configuration) override
    {
        deliver([this, configuration] {
            if (auto *controller = delegate.remoteViewController())
                controller->setConfiguration(configuration);
        });
    }
    void selectedColorDidArrive(const std::optional<platform::Color> &color,
                                const std::optional<std::string> &colorspace) override
    {
        deliver([this, color, colorspace] {
            if (auto *controller = delegate.remoteViewController())
                controller->setSelectedColor(color, colorspace);
        });
    }
    void prepareForDisplayDidArrive(std::uint32_t serial) override
    {
        deliver([this, serial] {
            if (auto *controller = delegate.remoteViewController()) {
                controller->prepareForDisplay([this, serial] {
                    favrin_remote_view_v1_prepared(view, serial);
                    flush();
                });
            }
        });
    }
    void presentDidArrive() override
    {
        deliver([this] { delegate.shouldPresent(); });
    }
    void focusWillEnterDidArrive(FocusDirection direction) override
    {
        deliver([this, direction] { delegate.focusWillEnter(direction); });
    }
    void colorPickerDidFinishDidArrive() override
    {
        deliver([this] {
            if (auto *controller = delegate.remoteViewController())
                controller->colorPickerDidFinish();
        });
    }
};

RemoteViewConnection::RemoteViewConnection(wl_display *display, RemoteViewConnectionDelegate &delegate)
    : d(std::make_unique<Private>(display, delegate))
{
    static constexpr wl_registry_listener listener = {.global = Private::global,
                                                      .global_remove = Private::globalRemove};
    d->registry = wl_display_get_registry(display);
    wl_registry_add_listener(d->registry, &listener, d.get());
    static constexpr wl_callback_listener globalsListener = {.done = Private::globalsDidArrive};
    d->globals = wl_display_sync(display);
    wl_callback_add_listener(d->globals, &globalsListener, d.get());
    d->flush();
}

RemoteViewConnection::~RemoteViewConnection()
{
    if (d->view)
        favrin_remote_view_v1_destroy(d->view);
    if (d->globals)
        wl_callback_destroy(d->globals);
    wl_registry_destroy(d->registry);
    d->flush();
}

void RemoteViewConnection::deliverEvents()
{
    d->delivers = true;
    for (const auto &event : std::exchange(d->waiting, {}))
        event();
}

void RemoteViewConnection::sendReady()
{
    if (!d->view || std::exchange(d->readySent, true))
        return;
    favrin_remote_view_v1_ready(d->view);
    d->flush();
}

void RemoteViewConnection::sendFocusDidLeave(FocusDirection direction)
{
    if (!d->view)
        return;
    favrin_remote_view_v1_focus_did_leave(d->view, static_cast<std::uint32_t>(direction));
    d->flush();
}

void RemoteViewConnection::pickerDidSelectColor(const std::optional<platform::Color> &color,
                                                const std::optional<std::string> &colorspace, bool isVolatile)
{
    if (!d->view)
        return;
    auto wire = encodeColor(color);
    if (!wire)
        return;
    wl_array array = {.size = wire->numbers.size() * sizeof(double), .alloc = 0, .data = wire->numbers.data()};
    favrin_remote_view_v1_picker_did_select_color(d->view, &array, wireText(wire->space), wireText(colorspace),
                                                  isVolatile);
    d->flush();
    // The message has woken the host, often on the very processor that is busy here, and the frame that follows would
    // keep it waiting.
    std::this_thread::yield();
}

void RemoteViewConnection::pickerDidShowEyedropper()
{
    if (!d->view)
        return;
    favrin_remote_view_v1_picker_did_show_eyedropper(d->view);
    d->flush();
}

void RemoteViewConnection::pickerDidFloatEyedropper()
{
    if (!d->view)
        return;
    favrin_remote_view_v1_picker_did_float_eyedropper(d->view);
    d->flush();
}

void RemoteViewConnection::pickerDidDismissEyedropper()
{
    if (!d->view)
        return;
    favrin_remote_view_v1_picker_did_dismiss_eyedropper(d->view);
    d->flush();
}

void RemoteViewConnection::colorPickerDidFinish()
{
    if (!d->view)
        return;
    d->delegate.presentationWillEnd();
    favrin_remote_view_v1_color_picker_did_finish(d->view);
    d->flush();
}

void RemoteViewConnection::preferredContentSizeDidChange(double width, double height)
{
    if (!d->view)
        return;
    favrin_remote_view_v1_set_preferred_content_size(d->view, wl_fixed_from_double(width),
                                                     wl_fixed_from_double(height));
    d->flush();
}

void RemoteViewConnection::backgroundEffectDidChange(BackgroundEffect effect)
{
    if (!d->view)
        return;
    favrin_remote_view_v1_set_background_effect(d->view, static_cast<uint32_t>(effect));
    d->flush();
}

} // namespace favrin::remote::client
