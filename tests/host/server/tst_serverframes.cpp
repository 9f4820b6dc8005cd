#include "presentedpair.h"

#include "host/server/damage.h"

#include <functional>
#include <limits>

#include <sys/socket.h>

using namespace favrin::host::server;
using Lines = std::vector<std::string>;
using Start = PresentedPair::Start;

namespace {

constexpr int most = std::numeric_limits<int>::max();
constexpr int least = std::numeric_limits<int>::min();

std::string textOf(const std::vector<PixelRect> &rects)
{
    std::string text;
    for (const PixelRect &rect : rects) {
        for (const int value : {rect.x, rect.y, rect.width, rect.height})
            text += std::to_string(value) + " ";
    }
    return text;
}

} // namespace

Q_DECLARE_METATYPE(std::vector<PixelRect>)

class ServerFramesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theHostMayDoAnythingWhenAFrameArrives_data()
    {
        using Act = std::function<void(PresentedPair &)>;
        QTest::addColumn<Act>("act");
        QTest::addColumn<bool>("isToldOfTheEnd");
        QTest::newRow("say something to a service that is gone") << Act([](PresentedPair &pair) {
            pair.server.pointerEnter(1, 1);
            pair.server.flush();
        }) << true;
        QTest::newRow("close the connection")
            << Act([](PresentedPair &pair) { pair.server.closeConnection(); }) << false;
        QTest::newRow("run a loop of its own") << Act([](PresentedPair &pair) { pair.server.dispatch(); }) << true;
    }

    void theHostMayDoAnythingWhenAFrameArrives()
    {
        QFETCH(std::function<void(PresentedPair &)>, act);
        QFETCH(bool, isToldOfTheEnd);
        PresentedPair pair(PresentedPair::Start::Mapped);
        int heard = 0;
        pair.delegate.onFrame = [&] {
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

    void init() { m_files.remember(); }
    void cleanup() { m_files.check(); }

    void damageStaysWithinThePicture_data()
    {
        QTest::addColumn<std::vector<PixelRect>>("points");
        QTest::addColumn<std::vector<PixelRect>>("pixels");
        QTest::addColumn<std::string>("within100");
        using Rects = std::vector<PixelRect>;
        QTest::newRow("points become pixels") << Rects{{1, 2, 3, 4}} << Rects() << std::string("2 4 6 8 ");
        QTest::newRow("pixels stay") << Rects() << Rects{{1, 2, 3, 4}} << std::string("1 2 3 4 ");
        QTest::newRow("cut at the edges")
            << Rects() << Rects{{-5, -5, 10, 10}, {95, 95, 10, 10}} << std::string("0 0 5 5 95 95 5 5 ");
        QTest::newRow("outside") << Rects() << Rects{{100, 0, 5, 5}, {0, -5, 5, 5}} << std::string();
        QTest::newRow("nothing, negative") << Rects{{0, 0, 0, 5}} << Rects{{5, 5, -2, 3}} << std::string();
        QTest::newRow("everything there is")
            << Rects{{least, least, most, most}, {0, 0, most, most}} << Rects() << std::string("0 0 100 100 ");
        QTest::newRow("largest at the largest place") << Rects{{most, most, most, most}} << Rects() << std::string();
        QTest::newRow("many become their box") << Rects() << Rects(17, {10, 10, 5, 5}) << std::string("10 10 5 5 ");
    }
    void damageStaysWithinThePicture()
    {
        QFETCH(std::vector<PixelRect>, points);
        QFETCH(std::vector<PixelRect>, pixels);
        QFETCH(std::string, within100);
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
        QCOMPARE(pair.service.eventsOf("configure"), Lines{"configure 20 10 0"});
        QVERIFY(!pair.server.isMapped());
        pair.service.acknowledge();
        wl_buffer *buffer = pair.service.makeBuffer(40, 20, 0x80123456);
        wl_surface_set_buffer_scale(pair.service.surface, 2);
        wl_callback *callback = wl_surface_frame(pair.service.surface);
        static const wl_callback_listener listener = {[](void *data, wl_callback *, std::uint32_t time) {
            static_cast<ScriptedService *>(data)->note("shown " + std::to_string(time));
        }};
        wl_callback_add_listener(callback, &listener, &pair.service);
        pair.service.commit(buffer, 40, 20);
        pair.exchange();
        QVERIFY(pair.server.isMapped());
        QCOMPARE(pair.delegate.frames.size(), std::size_t(1));
        const auto &[frame, pixels] = pair.delegate.frames[0];
        QCOMPARE(frame.width, 40);
        QCOMPARE(frame.height, 20);
        QCOMPARE(frame.scale, 2);
        QVERIFY(!frame.opaque);
        QCOMPARE(textOf(frame.damage), std::string("0 0 40 20 "));
        QVERIFY(std::ranges::all_of(pixels, [](std::uint32_t pixel) { return pixel == 0x80123456; }));
        QCOMPARE(pair.service.eventsOf("release").size(), std::size_t(1));
        QVERIFY(pair.service.eventsOf("shown").empty());
        pair.server.frameWasShown(4711);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("shown"), Lines{"shown 4711"});

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
        wl_buffer *gone = pair.service.makeBuffer(20, 10, 1);
        wl_buffer *last = pair.service.makeBuffer(20, 10, 2);
        pair.service.commit(gone, 20, 10);
        wl_surface_attach(pair.service.surface, last, 0, 0);
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
        wl_callback *callback = wl_surface_frame(pair.service.surface);
        static const wl_callback_listener listener = {
            [](void *data, wl_callback *, std::uint32_t) { static_cast<ScriptedService *>(data)->note("shown"); }};
        wl_callback_add_listener(callback, &listener, &pair.service);
        wl_surface_commit(pair.service.surface);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("shown").size(), std::size_t(1));
    }

    void theSurfaceComesAndGoes()
    {
        PresentedPair pair(Start::Mapped);
        pair.delegate.calls.clear();
        wl_surface_attach(pair.service.surface, nullptr, 0, 0);
        wl_surface_commit(pair.service.surface);
        pair.exchange();
        QVERIFY(!pair.server.isMapped());
        QCOMPARE(pair.delegate.calls, Lines{"unmap"});

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
        QCOMPARE(pair.service.eventsOf("configure"), Lines{"configure 100 50 0"});
        pair.service.acknowledge();
        pair.exchange();
        pair.service.acknowledge();
        // Nothing new, for which the service would draw once more.
        pair.server.configure(200, 50, 1);
        pair.exchange();
        pair.server.configure(-7, 2000000000, 1000);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("configure"),
                 (Lines{"configure 100 50 0", "configure 200 50 0", "configure 1 4096 0"}));
    }

    void furtherWindowsAndPopupsAreTurnedAway()
    {
        PresentedPair pair(Start::Mapped);
        static const xdg_popup_listener listener = [] {
            xdg_popup_listener l = {};
            l.popup_done = [](void *data, xdg_popup *) { static_cast<ScriptedService *>(data)->note("dismissed"); };
            return l;
        }();
        xdg_surface *parent = pair.service.xdgSurface;
        wl_surface *popupSurface = wl_compositor_create_surface(pair.service.compositor);
        xdg_positioner *positioner = xdg_wm_base_create_positioner(pair.service.shell);
        xdg_surface *popupXdg = xdg_wm_base_get_xdg_surface(pair.service.shell, popupSurface);
        xdg_popup_add_listener(xdg_surface_get_popup(popupXdg, parent, positioner), &listener, &pair.service);
        wl_surface_commit(popupSurface);
        pair.service.makeToplevel();
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("dismissed").size(), std::size_t(1));
        QCOMPARE(pair.service.eventsOf("close").size(), std::size_t(1));
        QVERIFY(pair.server.isMapped());
        QVERIFY(pair.delegate.closes.empty());
    }

    void memoryThatIsNotThereEndsTheServiceNotTheHost_data()
    {
        QTest::addColumn<int>("kept");
        QTest::newRow("nothing left") << 0;
        QTest::newRow("the first page left") << 4096;
    }
    void memoryThatIsNotThereEndsTheServiceNotTheHost()
    {
        QFETCH(int, kept);
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
            QCOMPARE(pair.delegate.closes.size(), std::size_t(1));
            QVERIFY(pair.delegate.closes[0].reason == CloseReason::ProtocolError);
            QVERIFY(pair.delegate.closes[0].detail.starts_with("wl_buffer error 2"));
        }
    }

    void lyingBuffersAreRefused_data()
    {
        QTest::addColumn<int>("offset");
        QTest::addColumn<int>("stride");
        QTest::addColumn<unsigned>("format");
        QTest::addColumn<bool>("isAccepted");
        QTest::newRow("honest") << 0 << 40 << unsigned(WL_SHM_FORMAT_XRGB8888) << true;
        QTest::newRow("rows overlap") << 0 << 10 << unsigned(WL_SHM_FORMAT_XRGB8888) << false;
        QTest::newRow("rows one byte short") << 0 << 39 << unsigned(WL_SHM_FORMAT_XRGB8888) << false;
        QTest::newRow("rows not aligned") << 0 << 42 << unsigned(WL_SHM_FORMAT_XRGB8888) << false;
        QTest::newRow("start not aligned") << 2 << 40 << unsigned(WL_SHM_FORMAT_XRGB8888) << false;
        QTest::newRow("beyond the pool") << 4096 << 40 << unsigned(WL_SHM_FORMAT_XRGB8888) << false;
        QTest::newRow("other format") << 0 << 40 << unsigned(WL_SHM_FORMAT_RGB565) << false;
    }
    void lyingBuffersAreRefused()
    {
        QFETCH(int, offset);
        QFETCH(int, stride);
        QFETCH(unsigned, format);
        PresentedPair pair(Start::Mapped);
        pair.delegate.frames.clear();
        wl_shm_pool *pool = pair.service.makePool(4096);
        wl_buffer *buffer = wl_shm_pool_create_buffer(pool, offset, 10, 10, stride, format);
        pair.service.commit(buffer, 10, 10);
        pair.exchange();
        QTEST(pair.delegate.closes.empty(), "isAccepted");
        QTEST(!pair.delegate.frames.empty(), "isAccepted");
    }

private:
    OpenFiles m_files;
};

QTEST_GUILESS_MAIN(ServerFramesTest)
#include "tst_serverframes.moc"
