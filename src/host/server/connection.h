#pragma once

#include "host/server/filemeter.h"
#include "host/server/objectmeter.h"
#include "host/server/remoteviewserver.h"
#include "host/server/resource.h"
#include "host/server/shmmeter.h"

#include <array>
#include <cstdint>
#include <optional>
#include <string>

#include <wayland-server-core.h>

namespace favrin::host::server {

/**
 * The display, the one client and the socket between them: taking over, reading, sending with care, and the end.
 *
 * The end is noticed anywhere but told only by takeEnd(), so that nobody is called in the middle of libwayland's work.
 */
class Connection
{
public:
    struct End
    {
        CloseReason reason = CloseReason::ServiceGone;
        std::string detail;
    };

    explicit Connection(RemoteViewServerDelegate &delegate);
    ~Connection();
    Connection(const Connection &) = delete;
    Connection &operator=(const Connection &) = delete;

    int open();
    bool adopt(int socket);
    int fileDescriptor() const;
    wl_display *display() const { return m_display; }
    /** Null before the opening and after the end. */
    wl_client *client() const { return m_client; }
    RemoteViewServerDelegate &delegate() { return m_delegate; }
    std::uint32_t nextSerial() { return wl_display_next_serial(m_display); }
    /** The serial of something that the user did, which entitles the service to what needs a user's act. */
    std::uint32_t nextInputSerial();
    bool isRecentInput(std::uint32_t serial) const;
    /** Milliseconds of the monotonic clock. */
    static std::uint32_t now();

    /**
     * Between these two the client's objects are in use, by us or by libwayland, and stay there whatever happens. False
     * when a turn is under way already: an owner's answer to what it is told may be a loop of its own.
     */
    bool beginTurn();
    void endTurn();
    bool isInTurn() const { return m_inTurn; }
    /** Reads and handles what one read of the socket gives; in a turn. */
    void readOnce();
    /** Between turns: a client that is gone goes with it. */
    void flush();
    /** Ends a connection that has failed; called between turns, when nothing of the client is in use. */
    void reap();
    /** The end, once. */
    std::optional<End> takeEnd();
    /** Ends the connection without telling anybody. */
    void close();

    /** The client is there and has done no wrong. */
    bool isUsable() const { return m_client && !m_failed; }
    /** There is room for an event that may be left out when the service does not read. */
    bool hasRoomForMotion() const;
    /** There is room for @p bytes of messages that can wait. */
    bool hasRoomFor(std::size_t bytes) const;
    /** There is room for an event that must arrive. Without it the connection fails: the service does not read. */
    bool admitsEvent();

    void limitExceeded(const std::string &what);
    /** The object that limits are complained about on, and where; null for the display. */
    void setLimitObject(wl_resource *resource) { m_limitObject.reset(resource); }

private:
    struct ClientListener : wl_listener
    {
        Connection *owner = nullptr;
    };

    static void clientWillGo(wl_listener *listener, void *data);
    static void messagePassed(void *data, wl_protocol_logger_type direction, const wl_protocol_logger_message *message);
    void noteError(const wl_protocol_logger_message &message);
    void fail(CloseReason reason, std::string detail);
    CloseReason reasonOfSilentEnd() const;
    int unreadBytes() const;
    void wake();

    RemoteViewServerDelegate &m_delegate;
    wl_display *m_display;
    wl_event_source *m_wakeTimer;
    wl_protocol_logger *m_logger;
    wl_client *m_client = nullptr;
    ClientListener m_clientListener = {{}, this};
    ObjectMeter m_objects;
    ShmMeter m_sharedMemory;
    FileMeter m_files;
    WeakResource m_limitObject;
    std::array<std::uint32_t, 32> m_inputSerials = {};
    std::size_t m_nextInputSlot = 0;
    int m_sendBuffer = 0;
    bool m_inTurn = false;
    bool m_failed = false;
    std::optional<End> m_end;
};

} // namespace favrin::host::server
