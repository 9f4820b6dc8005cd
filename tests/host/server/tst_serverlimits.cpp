#include "host/server/serverlimits.h"

#include "../../shared/table.h"
#include "presentedpair.h"

#include <array>
#include <functional>
#include <span>

#include <fcntl.h>
#include <sys/socket.h>

using namespace favrin::host::server;
using Start = PresentedPair::Start;

using Make = std::function<void(ScriptedService &)>;

namespace {

std::size_t limitOf(std::string_view interface)
{
    const auto found = std::ranges::find(limits::objects, interface, &limits::ObjectLimit::interface);
    return found == limits::objects.end() ? limits::objectsOfOtherKinds : found->count;
}

void makePopup(ScriptedService &service)
{
    wl_surface *surface = wl_compositor_create_surface(service.compositor);
    xdg_positioner *positioner = xdg_wm_base_create_positioner(service.shell);
    xdg_surface *xdg = xdg_wm_base_get_xdg_surface(service.shell, surface);
    xdg_surface_get_popup(xdg, nullptr, positioner);
    xdg_positioner_destroy(positioner);
}

using Words = std::vector<std::uint32_t>;

/** One Wayland request as bytes. */
Words request(std::uint32_t object, std::uint32_t opcode, std::uint32_t size, const Words &arguments = {})
{
    Words words = {object, size << 16 | opcode};
    words.insert(words.end(), arguments.begin(), arguments.end());
    return words;
}

/** A server whose service is bytes written by hand. */
struct Raw
{
    RecordingDelegate delegate;
    RemoteViewServer server{delegate};
    const int descriptor = server.openConnection();

    void dispatch(int turns)
    {
        for (int turn = 0; turn < turns; ++turn)
            server.dispatch();
    }
};

/** Writes @p data, together with @p count descriptors of one file. */
template<class Unit>
void sendFiles(int socket, std::span<const Unit> data, int file, std::size_t count)
{
    alignas(cmsghdr) std::array<char, CMSG_SPACE(28 * sizeof(int))> control = {};
    iovec bytes = {const_cast<Unit *>(data.data()), data.size_bytes()};
    msghdr message = {};
    message.msg_iov = &bytes;
    message.msg_iovlen = 1;
    message.msg_control = control.data();
    message.msg_controllen = CMSG_SPACE(count * sizeof(int));
    cmsghdr *header = CMSG_FIRSTHDR(&message);
    header->cmsg_level = SOL_SOCKET;
    header->cmsg_type = SCM_RIGHTS;
    header->cmsg_len = CMSG_LEN(count * sizeof(int));
    const std::vector<int> files(count, file);
    std::memcpy(CMSG_DATA(header), files.data(), count * sizeof(int));
    QCOMPARE(::sendmsg(socket, &message, MSG_DONTWAIT | MSG_NOSIGNAL), ssize_t(data.size_bytes()));
}

} // namespace

class ServerLimitsTest : public ServerTest
{
    Q_OBJECT

private Q_SLOTS:
    void objectsAreCounted_data()
    {
        constexpr int boundAtStart = 13;
        addRows<int, Make>({
            {"wl_surface", 0, [](auto &s) { wl_compositor_create_surface(s.compositor); }},
            {"wl_region", 0, [](auto &s) { wl_compositor_create_region(s.compositor); }},
            {"wl_shm_pool", 0, [](auto &s) { s.makePool(4096); }},
            {"wl_buffer", 0, [](auto &s) { s.makeBuffer(2, 2, 0); }},
            {"wl_callback", 0,
             [](auto &s) {
                 if (!s.surface)
                     s.surface = wl_compositor_create_surface(s.compositor);
                 wl_surface_frame(s.surface);
             }},
            {"xdg_popup", 0, makePopup},
            {"wl_data_source", 0, [](auto &s) { wl_data_device_manager_create_data_source(s.dataDeviceManager); }},
            {"zwp_text_input_v1", 1, [](auto &s) { zwp_text_input_manager_v1_create_text_input(s.textInputManager); }},
            {"wl_pointer", boundAtStart, [](auto &s) { wl_seat_get_pointer(s.seat); }},
        });
    }
    void objectsAreCounted()
    {
        const auto [alreadyThere, make] = row<int, Make>();
        const std::string interface = QTest::currentDataTag();
        PresentedPair pair;
        const int limit = static_cast<int>(limitOf(interface));
        for (int i = alreadyThere; i < limit; ++i) {
            make(pair.service);
            pair.exchange();
        }
        QVERIFY(pair.delegate.closes.empty());
        make(pair.service);
        pair.exchange();
        QCOMPARE(pair.protocolError(), std::string("favrin_remote_view_v1 6"));
        QVERIFY(pair.delegate.isClosedFor(CloseReason::LimitExceeded));
        QVERIFY(pair.delegate.closes[0].detail.find(interface) != std::string::npos);
    }

    void objectsThatAreGoneDoNotCount()
    {
        PresentedPair pair;
        for (int i = 0; i < 1000; ++i) {
            wl_surface_destroy(wl_compositor_create_surface(pair.service.compositor));
            wl_buffer_destroy(pair.service.makeBuffer(500, 500, 0));
            pair.exchange();
        }
        QVERIFY(pair.delegate.closes.empty());
    }

    void sharedMemoryIsCountedAsLongAsItIsMapped()
    {
        constexpr int third = static_cast<int>(limits::sharedMemoryBytes / 3);
        PresentedPair pair;
        // Pools without a buffer are gone when they are destroyed; one that grew counts as large as it is.
        for (int i = 0; i < 10; ++i) {
            int memory = -1;
            wl_shm_pool *pool = pair.service.makePool(4096, &memory);
            QCOMPARE(::ftruncate(memory, third), 0);
            ::close(memory);
            wl_shm_pool_resize(pool, third);
            wl_shm_pool_destroy(pool);
            pair.exchange();
        }
        QVERIFY(pair.delegate.closes.empty());
        // A buffer keeps its pool mapped.
        wl_buffer *buffer = nullptr;
        for (int i = 0; i < 3; ++i) {
            wl_shm_pool *pool = pair.service.makePool(third);
            buffer = wl_shm_pool_create_buffer(pool, 0, 1, 1, 4, WL_SHM_FORMAT_XRGB8888);
            wl_shm_pool_destroy(pool);
            pair.exchange();
        }
        QVERIFY(pair.delegate.closes.empty());
        wl_buffer_destroy(buffer);
        pair.service.makePool(third);
        pair.exchange();
        QVERIFY(pair.delegate.closes.empty());
        pair.service.makePool(4096);
        pair.exchange();
        QCOMPARE(pair.protocolError(), std::string("favrin_remote_view_v1 6"));
    }

    void typesOfOneClipboardOfferAreCounted()
    {
        PresentedPair pair;
        wl_data_source *source = wl_data_device_manager_create_data_source(pair.service.dataDeviceManager);
        for (std::size_t i = 0; i < limits::mimeTypes; ++i)
            wl_data_source_offer(source, ("type/" + std::to_string(i)).c_str());
        wl_data_source_offer(source, "type/0");
        pair.exchange();
        QVERIFY(pair.delegate.closes.empty());
        wl_data_source_offer(source, "one/more");
        pair.exchange();
        QVERIFY(pair.delegate.isClosedFor(CloseReason::LimitExceeded));
    }

    void preparationsOfTheHostAreCounted()
    {
        PresentedPair pair;
        for (std::uint32_t serial = 0; serial < 1000; ++serial)
            pair.server.sendPrepareForDisplay(serial);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("prepare").size(), limits::openPreparations);
        QVERIFY(!pair.delegate.warnings.empty());
    }

    void malformedBytesEndTheConnection_data()
    {
        Words tooLong = request(1, 1, 65532);
        tooLong.resize(4096);
        addRows<Words, std::string>({
            {"unknown object", request(77, 0, 8), "wl_display error 0"},
            {"unknown request", request(1, 9, 8), "wl_display error 1"},
            {"argument missing", request(1, 1, 8), "wl_display error 1"},
            {"null where an object must be", request(1, 1, 12, {0}), "wl_display error"},
            {"id of the server", request(1, 1, 12, {0xff000000}), "wl_display error"},
            {"id with a gap", request(1, 1, 12, {99}), "wl_display error"},
            {"size of zero", request(1, 1, 0), "wl_display error 1"},
            {"larger than a message may be", tooLong, ""},
        });
    }
    void malformedBytesEndTheConnection()
    {
        const auto [words, detail] = row<Words, std::string>();
        Raw raw;
        ::fcntl(raw.descriptor, F_SETFL, O_NONBLOCK);
        static_cast<void>(!::write(raw.descriptor, words.data(), words.size() * 4));
        raw.dispatch(8);
        ::close(raw.descriptor);
        QVERIFY(raw.delegate.isClosedFor(CloseReason::ProtocolError));
        QVERIFY2(raw.delegate.closes[0].detail.starts_with(detail), raw.delegate.closes[0].detail.c_str());
    }

    void halfAMessageAndStrayFilesAreHarmless()
    {
        Raw raw;
        // Two bytes of eight, and a file that no request asks for.
        const std::uint16_t half = 1;
        sendFiles<std::uint16_t>(raw.descriptor, {&half, 1}, raw.descriptor, 1);
        raw.dispatch(2);
        QVERIFY(raw.delegate.closes.empty());
        ::close(raw.descriptor);
    }

    void aServiceThatDiesBeforeItIsReadHasBrokenNoRule()
    {
        Raw raw;
        Words all;
        for (std::uint32_t id = 2; id < 1000; ++id) {
            const auto words = request(1, 0, 12, {id});
            all.insert(all.end(), words.begin(), words.end());
        }
        QCOMPARE(::write(raw.descriptor, all.data(), all.size() * 4), ssize_t(all.size() * 4));
        ::close(raw.descriptor);
        raw.dispatch(8);
        QVERIFY(raw.delegate.isClosedFor(CloseReason::ServiceGone));
    }

    void filesThatNoRequestAsksForAreCounted()
    {
        Raw raw;
        const int before = openFiles();
        int most = 0;
        for (std::uint32_t id = 2; id < 100 && raw.delegate.closes.empty(); ++id) {
            sendFiles<std::uint32_t>(raw.descriptor, request(1, 0, 12, {id}), raw.descriptor, 28);
            raw.dispatch(1);
            most = std::max(most, openFiles() - before);
        }
        QVERIFY(raw.delegate.isClosedFor(CloseReason::LimitExceeded));
        // Those of one more message than may be.
        QVERIFY2(most <= static_cast<int>(limits::strayFiles) + 28, std::to_string(most).c_str());
        ::close(raw.descriptor);
    }

    void aFloodIsTakenInSmallPortions()
    {
        PresentedPair pair(Start::Mapped);
        // Requests go through a socket that takes some hundred KiB; one turn must not try to empty it.
        const int before = static_cast<int>(pair.delegate.calls.size());
        for (int i = 0; i < 2000; ++i)
            favrin_remote_view_v1_set_background_effect(pair.service.view, 1);
        pair.service.flush();
        pair.server.dispatch();
        const int handled = static_cast<int>(pair.delegate.calls.size()) - before;
        QVERIFY(handled > 0);
        QVERIFY2(handled <= 4096 / 12, std::to_string(handled).c_str());
        pair.exchange();
        QCOMPARE(static_cast<int>(pair.delegate.calls.size()) - before, 2000);
    }
};

QTEST_GUILESS_MAIN(ServerLimitsTest)
#include "tst_serverlimits.moc"
