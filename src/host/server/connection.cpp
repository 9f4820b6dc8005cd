#include "host/server/connection.h"

#include "favrin-remote-view-v1-server-protocol.h"
#include "host/server/serverlimits.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <string_view>
#include <utility>

#include <linux/sockios.h>
#include <poll.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <time.h>
#include <unistd.h>

namespace favrin::host::server {

namespace {

/** The kernel gives less where its own limit is lower. */
constexpr int wantedSendBuffer = 1024 * 1024;

int sendBufferOf(int descriptor)
{
    int size = 0;
    socklen_t length = sizeof size;
    return ::getsockopt(descriptor, SOL_SOCKET, SO_SNDBUF, &size, &length) == 0 ? size : 0;
}

} // namespace

Connection::Connection(RemoteViewServerDelegate &delegate)
    : m_delegate(delegate)
    , m_display(wl_display_create())
    , m_wakeTimer(wl_event_loop_add_timer(
          wl_display_get_event_loop(m_display), [](void *) { return 0; }, nullptr))
    , m_logger(wl_display_add_protocol_logger(m_display, messagePassed, this))
    , m_objects([this](const std::string &what) { limitExceeded(what); })
    , m_sharedMemory([this](const std::string &what) { limitExceeded(what); })
    , m_files([this](const std::string &what) { limitExceeded(what); })
{
    m_clientListener.notify = clientWillGo;
    wl_display_init_shm(m_display);
}

Connection::~Connection()
{
    close();
    wl_protocol_logger_destroy(m_logger);
    wl_event_source_remove(m_wakeTimer);
    wl_display_destroy(m_display);
}

int Connection::open()
{
    std::array<int, 2> ends = {-1, -1};
    if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0)
        return -1;
    const auto [ours, theirs] = ends;
    if (adopt(ours))
        return theirs;
    const int error = errno;
    ::close(theirs);
    errno = error;
    return -1;
}

bool Connection::adopt(int socket)
{
    if (m_client) {
        ::close(socket);
        errno = EALREADY;
        return false;
    }
    ::setsockopt(socket, SOL_SOCKET, SO_SNDBUF, &wantedSendBuffer, sizeof wantedSendBuffer);
    m_client = wl_client_create(m_display, socket);
    if (!m_client) {
        const int error = errno;
        ::close(socket);
        errno = error;
        return false;
    }
    m_sendBuffer = sendBufferOf(socket);
    wl_client_add_destroy_listener(m_client, &m_clientListener);
    m_objects.watch(m_client);
    m_sharedMemory.watch(m_client);
    m_files.begin();
    return true;
}

int Connection::fileDescriptor() const
{
    return wl_event_loop_get_fd(wl_display_get_event_loop(m_display));
}

std::uint32_t Connection::nextInputSerial()
{
    const std::uint32_t serial = nextSerial();
    m_inputSerials[m_nextInputSlot] = serial;
    m_nextInputSlot = (m_nextInputSlot + 1) % m_inputSerials.size();
    return serial;
}

bool Connection::isRecentInput(std::uint32_t serial) const
{
    return serial != 0 && std::ranges::find(m_inputSerials, serial) != m_inputSerials.end();
}

std::uint32_t Connection::now()
{
    timespec time = {};
    ::clock_gettime(CLOCK_MONOTONIC, &time);
    return static_cast<std::uint32_t>(time.tv_sec * 1000 + time.tv_nsec / 1000000);
}

bool Connection::beginTurn()
{
    if (m_inTurn)
        return false;
    reap();
    m_inTurn = true;
    return true;
}

void Connection::endTurn()
{
    m_inTurn = false;
}

void Connection::readOnce()
{
    if (m_client)
        m_files.willRead(wl_client_get_fd(m_client));
    wl_event_loop_dispatch(wl_display_get_event_loop(m_display), 0);
    m_files.check();
}

void Connection::flush()
{
    // It destroys a client that does not listen any more.
    if (!m_inTurn)
        wl_display_flush_clients(m_display);
}

void Connection::reap()
{
    if (m_client && m_failed && !m_inTurn)
        wl_client_destroy(m_client);
}

std::optional<Connection::End> Connection::takeEnd()
{
    return m_client ? std::nullopt : std::exchange(m_end, std::nullopt);
}

void Connection::close()
{
    // In the middle of a read only an error keeps libwayland from handling what it has read already.
    if (m_inTurn && isUsable())
        wl_client_post_implementation_error(m_client, "closed");
    m_failed = true;
    m_end.reset();
    reap();
}

bool Connection::hasRoomForMotion() const
{
    return isUsable() && unreadBytes() < limits::unreadForMotion;
}

bool Connection::hasRoomFor(std::size_t bytes) const
{
    // The kernel counts what it allocates, which for messages of a few KiB is up to twice what they hold.
    return isUsable() && unreadBytes() + 2 * static_cast<int>(bytes) + 2 * limits::reserveForEvents < m_sendBuffer;
}

bool Connection::admitsEvent()
{
    if (!isUsable())
        return false;
    if (unreadBytes() + limits::reserveForEvents < m_sendBuffer)
        return true;
    limitExceeded("the service does not read its events");
    return false;
}

void Connection::limitExceeded(const std::string &what)
{
    if (!isUsable())
        return;
    fail(CloseReason::LimitExceeded, what);
    if (m_limitObject.get())
        wl_resource_post_error(m_limitObject.get(), FAVRIN_REMOTE_VIEW_V1_ERROR_LIMIT, "%s", what.c_str());
    else
        wl_client_post_implementation_error(m_client, "%s", what.c_str());
}

void Connection::clientWillGo(wl_listener *listener, void *)
{
    Connection &self = *static_cast<ClientListener *>(listener)->owner;
    if (!self.m_failed)
        self.fail(self.reasonOfSilentEnd(), "");
    self.m_client = nullptr;
}

void Connection::messagePassed(void *data, wl_protocol_logger_type direction, const wl_protocol_logger_message *message)
{
    Connection &self = *static_cast<Connection *>(data);
    if (direction == WL_PROTOCOL_LOGGER_REQUEST) {
        self.m_sharedMemory.requestArrived(*message);
        self.m_files.requestArrived(*message);
    } else if (message->resource && message->message_opcode == WL_DISPLAY_ERROR &&
               std::string_view(wl_resource_get_class(message->resource)) == "wl_display") {
        self.noteError(*message);
    }
}

// Errors are posted here, there and by libwayland itself; this is the one place where all of them pass.
void Connection::noteError(const wl_protocol_logger_message &message)
{
    auto *object = reinterpret_cast<wl_resource *>(message.arguments[0].o);
    const std::string on = object ? wl_resource_get_class(object) : "object";
    fail(CloseReason::ProtocolError,
         on + " error " + std::to_string(message.arguments[1].u) + ": " + message.arguments[2].s);
}

void Connection::fail(CloseReason reason, std::string detail)
{
    if (m_failed)
        return;
    m_failed = true;
    m_end = End{reason, std::move(detail)};
    wake();
}

// libwayland ends a connection over a message that it cannot read without posting an error.
CloseReason Connection::reasonOfSilentEnd() const
{
    // Not whether there is something left to read: of a service that dies nothing more is read.
    pollfd other = {wl_client_get_fd(m_client), POLLRDHUP, 0};
    const bool hasLeft = ::poll(&other, 1, 0) > 0;
    return hasLeft ? CloseReason::ServiceGone : CloseReason::ProtocolError;
}

int Connection::unreadBytes() const
{
    int unread = 0;
    return ::ioctl(wl_client_get_fd(m_client), SIOCOUTQ, &unread) == 0 ? unread : 0;
}

/** Makes fileDescriptor() readable, so that the owner comes back for what was noticed outside a turn. */
void Connection::wake()
{
    wl_event_source_timer_update(m_wakeTimer, 1);
}

} // namespace favrin::host::server
