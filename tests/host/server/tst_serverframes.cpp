#include "presentedpair.h"

#include "../../shared/table.h"
#include "host/server/damage.h"

#include <functional>
#include <limits>

#include <sys/socket.h>

using namespace favrin::host::server;
using namespace Qt::StringLiterals;
using Start = PresentedPair::Start;

namespace {

using Act = std::function<void(PresentedPair &)>;
using Rects = std::vector<PixelRect>;

constexpr int most = std::numeric_limits<int>::max();
constexpr int least = std::numeric_limits<int>::min();

std::string textOf(const Rects &rects)
{
    std::string text;
    for (const PixelRect &rect : rects) {
        for (const int value : {rect.x, rect.y, rect.width, rect.height})
            text += std::to_string(value) + " ";
    }
    return text;
}

} // namespace

class ServerFramesTest : public ServerTest
{
    Q_OBJECT

private Q_SLOTS:
    void theHostMayDoAnythingWhenAFrameArrives_data()
    {
        addRows<Act, bool>({
            {"say something to a service that is gone",
             [](auto &pair) {
                 pair.server.pointerEnter(1, 1);
                 pair.server.flush();
             },
             true},
            {"close the connection", [](auto &pair) { pair.server.closeConnection(); }, false},
            {"run a loop of its own", [](auto &pair) { pair.server.dispatch(); }, true},
        });
    }
    void theHostMayDoAnythingWhenAFrameArrives()
    {
        const auto [act, isToldOfTheEnd] = row<Act, bool>();
        PresentedPair pair(Start::Mapped);
        int heard = 0;
        pair.delegate.onFrame = [&, act = act] {
            ++heard;
            // Killed just now.
            ::shutdown(wl_display_get_fd(pair.service.display), SHUT_RDWR);
            act(pair);
        };
        pair.service.commit(pair.service.makeBuffer(20, 10, 1), 20, 10);
        pair.service.flush();
        for (int turn = 0; turn < 4; ++turn)
            pair.server.dispatch();
        QCOMPARE(heard, 1);
        QCOMPARE(pair.delegate.closes.size(), std::size_t(isToldOfTheEnd ? 1 : 0));
    }

    void damageStaysWithinThePicture_data()
    {
        addRows<Rects, Rects, std::string>({
            {"points become pixels", {{1, 2, 3, 4}}, {}, "2 4 6 8 "},
            {"pixels stay", {}, {{1, 2, 3, 4}}, "1 2 3 4 "},
            {"cut at the edges", {}, {{-5, -5, 10, 10}, {95, 95, 10, 10}}, "0 0 5 5 95 95 5 5 "},
            {"outside", {}, {{100, 0, 5, 5}, {0, -5, 5, 5}}, {}},
            {"nothing, negative", {{0, 0, 0, 5}}, {{5, 5, -2, 3}}, {}},
            {"everything there is", {{least, least, most, most}, {0, 0, most, most}}, {}, "0 0 100 100 "},
            {"largest at the largest place", {{most, most, most, most}}, {}, {}},
            {"many become their box", {}, Rects(17, {10, 10, 5, 5}), "10 10 5 5 "},
        });
    }
    void damageStaysWithinThePicture()
    {
        const auto [points, pixels, within100] = row<Rects, Rects, std::string>();
        Damage inPoints;
        for (const PixelRect &rect : points)
            inPoints.add(rect);
        Damage damage = inPoints.scaledBy(2);
        for (const PixelRect &rect : pixels)
            damage.add(rect);
        QCOMPARE(textOf(damage.within(100, 100)), within100);
    }

    void aFrameArrivesAsDrawn()
    {
        PresentedPair pair;
        pair.service.makeToplevel();
        pair.exchange();
        QCOMPARE(pair.heard("configure"), u"20 10 0"_s);
        QVERIFY(!pair.server.isMapped());
        pair.service.acknowledge();
        wl_buffer *buffer = pair.service.makeBuffer(40, 20, 0x80123456);
        wl_surface_set_buffer_scale(pair.service.surface, 2);
        pair.service.listenTo(wl_surface_frame(pair.service.surface));
        pair.service.commit(buffer, 40, 20);
        pair.exchange();
        QVERIFY(pair.server.isMapped());
        QCOMPARE(pair.delegate.frames.size(), std::size_t(1));
        const auto &[frame, pixels] = pair.delegate.frames[0];
        QCOMPARE((std::array{frame.width, frame.height, frame.scale}), (std::array{40, 20, 2}));
        QVERIFY(!frame.opaque);
        QCOMPARE(textOf(frame.damage), std::string("0 0 40 20 "));
        QVERIFY(std::ranges::all_of(pixels, [](std::uint32_t pixel) { return pixel == 0x80123456; }));
        QCOMPARE(pair.service.eventsOf("release").size(), std::size_t(1));
        QVERIFY(pair.service.eventsOf("done").empty());
        pair.server.frameWasShown(4711);
        pair.exchange();
        QCOMPARE(pair.heard("done"), u"4711"_s);

        // The same size again: only what is damaged counts.
        wl_surface_attach(pair.service.surface, buffer, 0, 0);
        wl_surface_damage(pair.service.surface, 1, 1, 2, 2);
        wl_surface_commit(pair.service.surface);
        pair.exchange();
        QCOMPARE(textOf(pair.delegate.frames.at(1).frame.damage), std::string("2 2 4 4 "));
    }

    void onlyTheNewestFrameOfATurnIsShown()
    {
        PresentedPair pair(Start::Mapped);
        pair.delegate.frames.clear();
        pair.service.commit(pair.service.makeBuffer(20, 10, 1), 20, 10);
        wl_surface_attach(pair.service.surface, pair.service.makeBuffer(20, 10, 2), 0, 0);
        wl_surface_commit(pair.service.surface);
        pair.exchange();
        QCOMPARE(pair.delegate.frames.size(), std::size_t(1));
        QCOMPARE(pair.delegate.frames[0].pixels[0], 2u);
        QCOMPARE(textOf(pair.delegate.frames[0].frame.damage), std::string("0 0 20 10 "));
        QCOMPARE(pair.service.eventsOf("release").size(), std::size_t(2));
    }

    void aBufferDestroyedBeforeItWasShownIsNotTouched()
    {
        PresentedPair pair(Start::Mapped);
        pair.delegate.frames.clear();
        wl_buffer *buffer = pair.service.makeBuffer(20, 10, 1);
        pair.service.commit(buffer, 20, 10);
        wl_buffer_destroy(buffer);
        pair.exchange();
        QVERIFY(pair.delegate.frames.empty());
        QVERIFY(pair.delegate.closes.empty());
    }

    void aCommitWithoutNewsIsAnsweredAtOnce()
    {
        PresentedPair pair(Start::Mapped);
        pair.service.listenTo(wl_surface_frame(pair.service.surface));
        wl_surface_commit(pair.service.surface);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("done").size(), std::size_t(1));
    }

    void theSurfaceComesAndGoes()
    {
        PresentedPair pair(Start::Mapped);
        pair.delegate.calls.clear();
        wl_surface_attach(pair.service.surface, nullptr, 0, 0);
        wl_surface_commit(pair.service.surface);
        pair.exchange();
        QVERIFY(!pair.server.isMapped());
        QCOMPARE(pair.told(), u"unmap"_s);

        // Anew from the first, empty commit.
        wl_surface_commit(pair.service.surface);
        pair.exchange();
        QCOMPARE(pair.service.configureSerials.size(), std::size_t(1));
        pair.service.acknowledge();
        pair.service.commit(pair.service.makeBuffer(20, 10, 0), 20, 10);
        pair.exchange();
        QVERIFY(pair.server.isMapped());

        xdg_toplevel_destroy(pair.service.toplevel);
        pair.exchange();
        QVERIFY(!pair.server.isMapped());
        xdg_surface_destroy(pair.service.xdgSurface);
        pair.exchange();
        QVERIFY(pair.delegate.closes.empty());

        wl_surface_destroy(pair.service.surface);
        pair.map();
        QVERIFY(pair.server.isMapped());
        wl_surface_destroy(pair.service.surface);
        pair.exchange();
        QVERIFY(!pair.server.isMapped());
        QVERIFY(pair.delegate.closes.empty());
    }

    void oneConfigureIsOpenAtATimeAndTheNewestSizeWins()
    {
        PresentedPair pair(Start::Mapped);
        for (int width = 100; width <= 200; ++width)
            pair.server.configure(width, 50, 1);
        pair.exchange();
        QCOMPARE(pair.heard("configure"), u"100 50 0"_s);
        pair.service.acknowledge();
        pair.exchange();
        pair.service.acknowledge();
        // Nothing new, for which the service would draw once more.
        pair.server.configure(200, 50, 1);
        pair.exchange();
        pair.server.configure(-7, 2000000000, 1000);
        pair.exchange();
        QCOMPARE(pair.heard("configure"), u"100 50 0, 200 50 0, 1 4096 0"_s);
    }

    void furtherWindowsAndPopupsAreTurnedAway()
    {
        PresentedPair pair(Start::Mapped);
        xdg_surface *parent = pair.service.xdgSurface;
        wl_surface *popupSurface = wl_compositor_create_surface(pair.service.compositor);
        xdg_positioner *positioner = xdg_wm_base_create_positioner(pair.service.shell);
        xdg_surface *popupXdg = xdg_wm_base_get_xdg_surface(pair.service.shell, popupSurface);
        pair.service.listenTo(xdg_surface_get_popup(popupXdg, parent, positioner));
        wl_surface_commit(popupSurface);
        pair.service.makeToplevel();
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("popup_done").size(), std::size_t(1));
        QCOMPARE(pair.service.eventsOf("close").size(), std::size_t(1));
        QVERIFY(pair.server.isMapped());
        QVERIFY(pair.delegate.closes.empty());
    }

    void memoryThatIsNotThereEndsTheServiceNotTheHost_data()
    {
        addRows<int>({
            {"nothing left", 0},
            {"the first page left", 4096},
        });
    }
    void memoryThatIsNotThereEndsTheServiceNotTheHost()
    {
        const auto [kept] = row<int>();
        // Again and again, also in a second server: nothing of the first time must linger.
        for (int round = 0; round < 3; ++round) {
            PresentedPair pair(Start::Mapped);
            int memory = -1;
            wl_shm_pool *pool = pair.service.makePool(100 * 100 * 4, &memory);
            wl_buffer *buffer = wl_shm_pool_create_buffer(pool, 0, 100, 100, 400, WL_SHM_FORMAT_XRGB8888);
            pair.exchange();
            QCOMPARE(::ftruncate(memory, kept), 0);
            ::close(memory);
            pair.service.commit(buffer, 100, 100);
            pair.exchange();
            QVERIFY(pair.delegate.isClosedFor(CloseReason::ProtocolError));
            QVERIFY(pair.delegate.closes[0].detail.starts_with("wl_buffer error 2"));
        }
    }

    void lyingBuffersAreRefused_data()
    {
        constexpr std::uint32_t xrgb = WL_SHM_FORMAT_XRGB8888;
        addRows<int, int, std::uint32_t, bool>({
            {"honest", 0, 40, xrgb, true},
            {"rows overlap", 0, 10, xrgb, false},
            {"rows one byte short", 0, 39, xrgb, false},
            {"rows not aligned", 0, 42, xrgb, false},
            {"start not aligned", 2, 40, xrgb, false},
            {"beyond the pool", 4096, 40, xrgb, false},
            {"other format", 0, 40, WL_SHM_FORMAT_RGB565, false},
        });
    }
    void lyingBuffersAreRefused()
    {
        const auto [offset, stride, format, isAccepted] = row<int, int, std::uint32_t, bool>();
        PresentedPair pair(Start::Mapped);
        pair.delegate.frames.clear();
        wl_shm_pool *pool = pair.service.makePool(4096);
        wl_buffer *buffer = wl_shm_pool_create_buffer(pool, offset, 10, 10, stride, format);
        pair.service.commit(buffer, 10, 10);
        pair.exchange();
        QCOMPARE(pair.delegate.closes.empty(), isAccepted);
        QCOMPARE(!pair.delegate.frames.empty(), isAccepted);
    }
};

QTEST_GUILESS_MAIN(ServerFramesTest)
#include "tst_serverframes.moc"
