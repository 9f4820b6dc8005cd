#include "recordingdelegate.h"
#include "scriptedservice.h"

#include <QDir>
#include <QtTest>

#include <array>
#include <cstring>
#include <memory>
#include <random>

#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

using namespace favrin::host::server;

namespace {

constexpr std::uint32_t seed = 20260726;
constexpr int sessions = 300;

/** What one write of a client held. */
struct Chunk
{
    std::vector<char> bytes;
    std::vector<int> files;
};

union Control {
    cmsghdr header;
    std::array<char, CMSG_SPACE(28 * sizeof(int))> space;
};

std::optional<Chunk> receive(int socket)
{
    Chunk chunk;
    chunk.bytes.resize(4096);
    Control control = {};
    iovec data = {chunk.bytes.data(), chunk.bytes.size()};
    msghdr message = {};
    message.msg_iov = &data;
    message.msg_iovlen = 1;
    message.msg_control = &control;
    message.msg_controllen = sizeof control;
    const ssize_t got = ::recvmsg(socket, &message, MSG_DONTWAIT | MSG_CMSG_CLOEXEC);
    if (got <= 0)
        return std::nullopt;
    chunk.bytes.resize(static_cast<std::size_t>(got));
    if (const cmsghdr *header = CMSG_FIRSTHDR(&message)) {
        chunk.files.resize((header->cmsg_len - CMSG_LEN(0)) / sizeof(int));
        std::memcpy(chunk.files.data(), CMSG_DATA(header), chunk.files.size() * sizeof(int));
    }
    return chunk;
}

void send(int socket, const Chunk &chunk)
{
    Control control = {};
    iovec data = {const_cast<char *>(chunk.bytes.data()), chunk.bytes.size()};
    msghdr message = {};
    message.msg_iov = &data;
    message.msg_iovlen = 1;
    if (!chunk.files.empty()) {
        message.msg_control = &control;
        message.msg_controllen = CMSG_SPACE(chunk.files.size() * sizeof(int));
        cmsghdr *header = CMSG_FIRSTHDR(&message);
        header->cmsg_level = SOL_SOCKET;
        header->cmsg_type = SCM_RIGHTS;
        header->cmsg_len = CMSG_LEN(chunk.files.size() * sizeof(int));
        std::memcpy(CMSG_DATA(header), chunk.files.data(), chunk.files.size() * sizeof(int));
    }
    static_cast<void>(!::sendmsg(socket, &message, MSG_DONTWAIT | MSG_NOSIGNAL));
}

/** Between a client and a server; keeps what the client says. */
class Relay
{
public:
    explicit Relay(int serverEnd) : m_server(serverEnd)
    {
        std::array<int, 2> ends = {-1, -1};
        static_cast<void>(!::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()));
        m_client = ends[0];
        clientEnd = ends[1];
    }
    ~Relay()
    {
        ::close(m_server);
        ::close(m_client);
        for (const Chunk &chunk : said)
            std::ranges::for_each(chunk.files, ::close);
    }
    Relay(const Relay &) = delete;
    Relay &operator=(const Relay &) = delete;

    void pass()
    {
        while (auto chunk = receive(m_client)) {
            send(m_server, *chunk);
            said.push_back(std::move(*chunk));
        }
        while (auto chunk = receive(m_server)) {
            send(m_client, *chunk);
            std::ranges::for_each(chunk->files, ::close);
        }
    }

    int clientEnd = -1;
    std::vector<Chunk> said;

private:
    int m_server;
    int m_client;
};

void drive(RemoteViewServer &server, std::uint32_t time)
{
    server.pointerMotion(time, 3, 3);
    server.keyboardKey(time, 30, time % 2);
    server.commitText("x");
    server.frameWasShown(time);
    server.flush();
}

void prepare(RemoteViewServer &server)
{
    server.configure(20, 10, 1);
    server.pointerEnter(1, 1);
    server.keyboardEnter();
    server.setClipboard({"text/plain"});
    server.sendConfiguration({.title = "Title"});
    server.sendPrepareForDisplay(1);
}

/** Everything a service does on a good day. */
void livesAFullLife(ScriptedService &service, const std::function<void()> &exchange)
{
    exchange();
    service.bindAll();
    exchange();
    service.makeToplevel();
    exchange();
    service.acknowledge();
    std::array numbers = {0.1, 0.2, 0.3, 1.0};
    wl_array color = {sizeof numbers, 0, numbers.data()};
    favrin_remote_view_v1_ready(service.view);
    favrin_remote_view_v1_prepared(service.view, 1);
    favrin_remote_view_v1_set_preferred_content_size(service.view, wl_fixed_from_int(360), wl_fixed_from_int(600));
    for (int i = 0; i < 3; ++i) {
        wl_buffer *buffer = service.makeBuffer(20, 10, 7);
        wl_surface_frame(service.surface);
        service.commit(buffer, 20, 10);
        favrin_remote_view_v1_picker_did_select_color(service.view, &color, "kTQColorSpaceSRGB", "kTQColorSpaceSRGB",
                                                      1);
        exchange();
        wl_buffer_destroy(buffer);
    }
    zwp_text_input_v1_activate(service.textInput, service.seat, service.surface);
    zwp_text_input_v1_set_surrounding_text(service.textInput, "text", 1, 2);
    zwp_text_input_v1_commit_state(service.textInput, 3);
    wl_surface *cursor = wl_compositor_create_surface(service.compositor);
    wl_pointer_set_cursor(service.pointer, service.inputSerial, cursor, 0, 0);
    wl_data_source *source = wl_data_device_manager_create_data_source(service.dataDeviceManager);
    wl_data_source_offer(source, "text/plain");
    wl_data_device_set_selection(service.dataDevice, source, service.inputSerial);
    exchange();
    wl_surface_destroy(cursor);
    wl_surface_attach(service.surface, nullptr, 0, 0);
    wl_surface_commit(service.surface);
    xdg_toplevel_destroy(service.toplevel);
    xdg_surface_destroy(service.xdgSurface);
    wl_surface_destroy(service.surface);
    favrin_remote_view_v1_color_picker_did_finish(service.view);
    exchange();
}

} // namespace

class ServerMutationsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void damagedSessionsNeverHurtTheHost()
    {
        RecordingDelegate healthy;
        RemoteViewServer server(healthy);
        prepare(server);
        Relay relay(server.openConnection());
        auto service = std::make_unique<ScriptedService>(relay.clientEnd);
        std::uint32_t time = 0;
        livesAFullLife(*service, [&] {
            for (int i = 0; i < 4; ++i) {
                service->flush();
                relay.pass();
                server.dispatch();
                drive(server, ++time);
                relay.pass();
                service->read();
            }
        });
        QVERIFY(healthy.closes.empty());
        QCOMPARE(healthy.picks.size(), std::size_t(3));
        QCOMPARE(healthy.calls.back(), QStringLiteral("finish"));

        const auto filesBefore = QDir(QStringLiteral("/proc/self/fd")).count();
        std::mt19937 random(seed);
        int ended = 0;
        for (int i = 0; i < sessions; ++i)
            ended += replayDamaged(relay.said, random) ? 1 : 0;
        // Most damage is noticed; some of it means something else, which is fine.
        QVERIFY2(ended > sessions / 4, std::to_string(ended).c_str());
        QCOMPARE(QDir(QStringLiteral("/proc/self/fd")).count(), filesBefore);
    }

private:
    /** True when the server ended the session before the client did. */
    static bool replayDamaged(const std::vector<Chunk> &said, std::mt19937 &random)
    {
        RecordingDelegate delegate;
        RemoteViewServer server(delegate);
        prepare(server);
        const int socket = server.openConnection();
        const std::size_t damaged = random() % said.size();
        for (std::size_t i = 0; i < said.size(); ++i) {
            Chunk chunk = said[i];
            for (std::uint32_t hits = i >= damaged ? 1 + random() % 3 : 0; hits > 0; --hits)
                chunk.bytes[random() % chunk.bytes.size()] = static_cast<char>(random());
            send(socket, chunk);
            server.dispatch();
            drive(server, static_cast<std::uint32_t>(i));
            while (const auto answer = receive(socket))
                std::ranges::for_each(answer->files, ::close);
        }
        const bool endedEarly = !delegate.closes.empty();
        ::close(socket);
        for (int i = 0; i < 3; ++i)
            server.dispatch();
        if (delegate.closes.size() != 1)
            qWarning("%zu ends of one session", delegate.closes.size());
        return endedEarly && delegate.closes.size() == 1;
    }
};

QTEST_GUILESS_MAIN(ServerMutationsTest)
#include "tst_servermutations.moc"
