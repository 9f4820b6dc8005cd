#pragma once

#include "platform/color/color.h"
#include "remote/records.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace favrin::host::server {

/** A rectangle in pixels of the surface, origin top left. */
struct PixelRect
{
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;

    bool operator==(const PixelRect &) const = default;
};

/** What the service drew: premultiplied BGRA in memory (ARGB32 on a little-endian machine), origin top left. */
struct Frame
{
    const unsigned char *pixels = nullptr;
    /** Pixels. */
    int width = 0;
    int height = 0;
    /** Bytes from one row to the next. */
    int stride = 0;
    /** Pixels per point that the service drew with. */
    int scale = 1;
    /** True when the alpha bytes mean nothing. */
    bool opaque = false;
    /** The parts that changed since the last frame, within the surface. */
    std::vector<PixelRect> damage;
};

/** What the service says of the text field that has its focus; positions are in bytes of the UTF-8 text. */
struct TextInputState
{
    bool enabled = false;
    std::string surroundingText;
    std::uint32_t cursor = 0;
    std::uint32_t anchor = 0;
    /** Purpose and hints as numbered by text-input-unstable-v1. */
    std::uint32_t contentPurpose = 0;
    std::uint32_t contentHints = 0;
    /** Points of the surface. */
    PixelRect cursorRectangle;
    std::string preferredLanguage;
    /** The service asks for an input panel, such as an on-screen keyboard. */
    bool wantsInputPanel = false;
    /** Grows when text that is being composed is to be forgotten. */
    std::uint32_t resets = 0;

    bool operator==(const TextInputState &) const = default;
};

enum class CloseReason {
    /** The other end of the socket is gone: the service exited or was killed. */
    ServiceGone,
    /** The service broke a rule and was disconnected; the detail says which. */
    ProtocolError,
    /** The service exceeded a limit and was disconnected. */
    LimitExceeded,
};

/**
 * What comes from the service. Called from dispatch() only, on its thread. A call may send and close, but may destroy
 * the server only by way of a later turn.
 */
class RemoteViewServerDelegate
{
public:
    virtual ~RemoteViewServerDelegate() = default;

    /** The pixels are readable during the call only. */
    virtual void frameDidArrive(const Frame &frame) = 0;
    /** The picker took its surface away; not called when the connection ends. */
    virtual void surfaceDidUnmap() = 0;

    virtual void serviceIsReady() = 0;
    virtual void serviceDidPrepare(std::uint32_t serial) = 0;
    /** @p colorspace is the name that the message to the app carries; a color may have a space and come without it. */
    virtual void pickerDidSelectColor(const std::optional<platform::Color> &color,
                                      const std::optional<std::string> &colorspace, bool isVolatile) = 0;
    virtual void pickerDidShowEyedropper() = 0;
    virtual void pickerDidFloatEyedropper() = 0;
    virtual void pickerDidDismissEyedropper() = 0;
    virtual void colorPickerDidFinish() = 0;
    /** Points, 0 … remote::limits::largestSize. */
    virtual void preferredContentSizeDidChange(double width, double height) = 0;
    virtual void backgroundEffectDidChange(remote::BackgroundEffect effect) = 0;
    /** The keyboard focus moved past the picker's last element in that direction. */
    virtual void focusDidLeave(remote::FocusDirection direction) = 0;

    virtual void textInputDidChange(const TextInputState &state) = 0;
    /** The service owns the clipboard and offers these types; empty when it has nothing any more. */
    virtual void serviceDidOfferClipboard(const std::vector<std::string> &mimeTypes) = 0;
    /** The service wants the host's clipboard in this type: write it to @p descriptor and close it, on any thread. */
    virtual void serviceWantsClipboard(const std::string &mimeType, int descriptor) = 0;
    /**
     * Name of the pointer's shape by the cursor naming of the desktop; empty hides it. The service shows pictures, of
     * which no name is known: what is not hidden is "default".
     */
    virtual void cursorDidChange(const std::string &name) = 0;
    /** Ping not answered for a while; it will be told again when the service answers. */
    virtual void serviceResponsivenessDidChange(bool responsive) = 0;

    /** Something that the owner asked for was cut or left out; for the log. */
    virtual void serverDidWarn(const std::string &message) { static_cast<void>(message); }

    /** The last call: nothing comes after it. Not called for closeConnection(). */
    virtual void connectionDidClose(CloseReason reason, const std::string &detail) = 0;
};

/**
 * A Wayland server for one client, the picker service, over a private socket pair. Nothing listens under a public name.
 *
 * Knows no toolkit. The owner watches fileDescriptor() and calls dispatch() when it is readable; calls that send
 * something are flushed by flush(), which the owner calls before it goes back to its event loop. One thread.
 *
 * Offered: compositor, shm (ARGB8888 and XRGB8888), seat (pointer, keyboard, touch), output, xdg_wm_base (one toplevel;
 * popups are dismissed at once), text-input-unstable-v1, data device (clipboard only), favrin_remote_view_v1. Limits
 * per client are in serverlimits.h.
 *
 * Nothing waits for the service and nothing piles up: of what it does not read, motion is held back and the newest is
 * sent later; what must arrive is sent until the socket is full, which ends the connection.
 */
class RemoteViewServer
{
public:
    explicit RemoteViewServer(RemoteViewServerDelegate &delegate);
    ~RemoteViewServer();
    RemoteViewServer(const RemoteViewServer &) = delete;
    RemoteViewServer &operator=(const RemoteViewServer &) = delete;

    /**
     * Makes the socket pair and the client; call once. Returns the service's end (close-on-exec is set; the launcher
     * clears it in the child), or -1 with errno.
     */
    int openConnection();
    /**
     * Serves the client at the other end of @p socket, which belongs to the server from now on, instead of
     * openConnection(). False with errno when that cannot be; the socket is closed then.
     */
    bool adoptConnection(int socket);

    int fileDescriptor() const;
    /**
     * Handles at most 4,096 bytes of requests and tells the delegate; of the frames among them only the newest. Called
     * from within a call of the delegate it does nothing.
     */
    void dispatch();
    /** Sends what waits. What goes wrong here makes fileDescriptor() readable and is told by the next dispatch(). */
    void flush();

    // Surface.
    /** Size in points (clamped to 1 … remote::limits::largestSurface) and whole-numbered scale (1 … largestScale). */
    void configure(int width, int height, int scale);
    /** Tells the service that its last frame is on screen; it draws the next one only after this. */
    void frameWasShown(std::uint32_t milliseconds);

    // Messages to the service; see the protocol. Lists and texts beyond the limits are cut, which serverDidWarn() says.
    // Until the service has bound the extension, and while it does not read, the newest of each kind waits; then they
    // go out as traits, configuration, color, prepare, present, finish.
    void sendTraits(const remote::Traits &traits);
    void sendConfiguration(const remote::Configuration &configuration);
    void sendSelectedColor(const std::optional<platform::Color> &color, const std::optional<std::string> &colorspace);
    void sendPrepareForDisplay(std::uint32_t serial);
    void sendPresent();
    /** To be sent after keyboardEnter(). */
    void sendFocusWillEnter(remote::FocusDirection direction);
    void sendColorPickerDidFinish();

    // Input. Positions in points of the surface, fractions allowed; times in milliseconds of any one clock.
    void pointerEnter(double x, double y);
    void pointerLeave();
    void pointerMotion(std::uint32_t time, double x, double y);
    /** @p button is the evdev code (BTN_LEFT is 0x110). */
    void pointerButton(std::uint32_t time, std::uint32_t button, bool pressed);
    /**
     * Scrolling in points; whole wheel clicks in @p discrete (0 for a touchpad). Positive is down or right. All zero
     * ends the scrolling of a touchpad.
     */
    void pointerAxis(std::uint32_t time, double horizontal, double vertical, int horizontalDiscrete,
                     int verticalDiscrete);
    /** Ends a group of events that belong together; flush() does it, too. */
    void pointerFrame();

    void touchDown(std::uint32_t time, int id, double x, double y);
    void touchMotion(std::uint32_t time, int id, double x, double y);
    void touchUp(std::uint32_t time, int id);
    /** As pointerFrame(). */
    void touchFrame();
    void touchCancel();

    /**
     * The host's keymap as an XKB text, empty for the default keymap. A text that is no keymap changes nothing. The
     * service is offered a keyboard when this or setKeymapFromNames() is called first; what is typed until then waits.
     */
    void setKeymap(const std::string &keymap);
    /** Layout names ("us", "de") for a host that cannot give its keymap. */
    void setKeymapFromNames(const std::string &rules, const std::string &model, const std::string &layout,
                            const std::string &variant, const std::string &options);
    void setRepeat(int keysPerSecond, int delayMilliseconds);
    /** The picker has the host's keyboard focus; its window counts as active. */
    void keyboardEnter();
    void keyboardLeave();
    /** @p key is the evdev code (the X11 code less 8). */
    void keyboardKey(std::uint32_t time, std::uint32_t key, bool pressed);
    void keyboardModifiers(std::uint32_t depressed, std::uint32_t latched, std::uint32_t locked, std::uint32_t group);
    /** The evdev code and modifiers of the current keymap that type this keysym, if there are any. */
    struct KeyCode
    {
        std::uint32_t key = 0;
        std::uint32_t modifiers = 0;
    };
    std::optional<KeyCode> keyCodeForKeysym(std::uint32_t keysym) const;

    // Input method.
    void commitText(const std::string &text);
    /** @p cursor in bytes of @p text. */
    void preeditText(const std::string &text, int cursor);
    /** Removes bytes before and after the cursor. */
    void deleteSurroundingText(std::uint32_t before, std::uint32_t after);

    // Clipboard.
    /**
     * The host's clipboard offers these types (at most 32 are passed on); empty when it holds nothing of use. It takes
     * the place of what the service has offered, so do not call it for the service's own content.
     */
    void setClipboard(const std::vector<std::string> &mimeTypes);
    /** Asks the service's clipboard for a type: the service writes it to @p descriptor, which is closed here. */
    void requestServiceClipboard(const std::string &mimeType, int descriptor);

    // Watchdog.
    /** Pings the service, or, if the last ping was not answered yet, tells serviceResponsivenessDidChange(false). */
    void ping();

    /** The service's surface is on screen or not. */
    bool isMapped() const;
    /** Ends the connection at once. No delegate call follows, not even connectionDidClose(). */
    void closeConnection();

private:
    struct Private;
    std::unique_ptr<Private> d;
};

} // namespace favrin::host::server
