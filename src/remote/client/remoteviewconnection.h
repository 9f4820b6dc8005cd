#pragma once

#include "remote/records.h"
#include "remote/remotehost.h"

#include <memory>

struct wl_display;

namespace favrin::remote::client {

/** What the host says beside the messages to the front. Main thread. */
class RemoteViewConnectionDelegate
{
public:
    virtual ~RemoteViewConnectionDelegate() = default;
    /** The other end is no host of ours; nothing else will come. */
    virtual void hostIsMissing() = 0;
    /** Traits that belong together; they come once before anything else. Sanitised. */
    virtual void traitsDidChange(const Traits &traits) = 0;
    /** The app presents the picker now. */
    virtual void shouldPresent() = 0;
    /** The keyboard focus moves in from the host's other elements. */
    virtual void focusWillEnter(FocusDirection direction) = 0;
    /** Called before the host hears of the end, so that what the picker still has to say comes first. */
    virtual void presentationWillEnd() = 0;
    /** The controller that hears the host's messages; null while there is none. */
    virtual RemoteViewController *remoteViewController() = 0;
};

/**
 * The service's end of favrin_remote_view_v1: translates wire events into records and messages, and messages into
 * requests. Everything that comes in is checked and made sane here; nothing the host sends ends the process.
 *
 * Events are delivered on the main thread by the dispatching of Qt's Wayland plugin. Requests may be sent on any
 * thread.
 */
class RemoteViewConnection : public RemoteHost
{
public:
    /**
     * Binds the host's global on @p display; the first events come with the next dispatch. All but the traits wait for
     * deliverEvents().
     */
    RemoteViewConnection(wl_display *display, RemoteViewConnectionDelegate &delegate);
    ~RemoteViewConnection() override;
    RemoteViewConnection(const RemoteViewConnection &) = delete;
    RemoteViewConnection &operator=(const RemoteViewConnection &) = delete;

    /** The picker is there to hear what the host says: delivers what waits, and from now on everything at once. */
    void deliverEvents();

    /** Tells the host, once, that the picker could be shown at once. */
    void sendReady();

    /** Tells the host that the keyboard focus moved out of the picker. */
    void sendFocusDidLeave(FocusDirection direction);

    void pickerDidSelectColor(const std::optional<platform::Color> &color, const std::optional<std::string> &colorspace,
                              bool isVolatile) override;
    void pickerDidShowEyedropper() override;
    void pickerDidFloatEyedropper() override;
    void pickerDidDismissEyedropper() override;
    void colorPickerDidFinish() override;
    void preferredContentSizeDidChange(double width, double height) override;
    void backgroundEffectDidChange(BackgroundEffect effect) override;

private:
    struct Private;
    std::unique_ptr<Private> d;
};

/** The connection of Qt's Wayland platform plugin, or null on another platform. */
wl_display *qtWaylandDisplay();

} // namespace favrin::remote::client
