#include "presentedpair.h"

#include "remote/limits.h"

#include <cmath>
#include <limits>

#include <sys/socket.h>

using namespace favrin;
using Start = PresentedPair::Start;

namespace {

std::vector<platform::Color> alternatingColors(int count)
{
    std::vector<platform::Color> colors;
    for (int i = 0; i < count; ++i) {
        const auto space = i % 2 ? platform::ColorSpace::displayP3() : platform::ColorSpace::sRGB();
        colors.emplace_back(space, std::array{i / 4096.0, 0.1, 0.2}, 1.0);
    }
    return colors;
}

using Lines = std::vector<std::string>;
using Misuse = std::function<void(ScriptedService &)>;

void pick(ScriptedService &service, std::vector<double> numbers, const char *space, const char *colorspace,
          std::uint32_t isVolatile = 0)
{
    wl_array array = {numbers.size() * sizeof(double), 0, numbers.data()};
    favrin_remote_view_v1_picker_did_select_color(service.view, &array, space, colorspace, isVolatile);
}

} // namespace

Q_DECLARE_METATYPE(Misuse)

class ServerMessagesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_files.remember(); }
    void cleanup() { m_files.check(); }

    void whatWasSaidBeforeTheBindArrivesInOrder()
    {
        PresentedPair pair(Start::Unbound);
        pair.server.sendPresent();
        pair.server.sendSelectedColor(platform::Color::black(), "kTQColorSpaceDisplayP3");
        pair.server.sendConfiguration({.title = "Old"});
        pair.server.sendConfiguration({.title = "Nové", .showsAlpha = false, .hostWindowWidth = 1024.0});
        pair.server.sendTraits({.appearance = remote::Appearance::Dark, .locale = "cs-CZ", .reduceMotion = true});
        pair.service.bindAll();
        pair.exchange();
        QVERIFY(pair.delegate.calls.empty());
        const Lines expected = {
            "context 0",  "appearance 2", "direction 0",        "text_size 3",
            "display 0 ", "locale cs-CZ", "accessibility 1",    "traits_done",
            "options 36", "grid_style 0", "configuration_done", "color kTQColorSpaceGray kTQColorSpaceDisplayP3",
            "present"};
        Lines heard;
        for (const std::string &event : pair.service.events) {
            if (!event.starts_with("keyboard") && !event.starts_with("seat") && !event.starts_with("selection"))
                heard.push_back(event);
        }
        QCOMPARE(heard, expected);
        QCOMPARE(pair.service.title, std::string("Nové"));
        QCOMPARE(pair.service.geometry, (std::vector{1024.0, 0.0, 0.0}));
        QCOMPARE(pair.service.colorRuns, (std::vector<std::vector<double>>{{0.0, 1.0}}));
    }

    void suggestedColorsArriveThoughTheServiceIsBusy_data()
    {
        QTest::addColumn<int>("sent");
        QTest::addColumn<int>("arrived");
        QTest::addColumn<bool>("isCut");
        QTest::newRow("none") << 0 << 0 << false;
        QTest::newRow("a thousand") << 1000 << 1000 << false;
        QTest::newRow("the most, each in a message of its own") << 2048 << 2048 << false;
        QTest::newRow("too many") << 3000 << 2048 << true;
    }
    void suggestedColorsArriveThoughTheServiceIsBusy()
    {
        QFETCH(int, sent);
        QFETCH(int, arrived);
        PresentedPair pair;
        pair.server.sendConfiguration({.suggestedColors = alternatingColors(sent)});
        // Nobody reads in the meantime, and the host goes on talking.
        for (int i = 0; i < 100; ++i) {
            pair.server.sendConfiguration({.title = "newer", .suggestedColors = alternatingColors(sent)});
            pair.server.flush();
        }
        pair.exchange();
        QTEST(!pair.delegate.warnings.empty(), "isCut");
        QVERIFY(pair.delegate.closes.empty());
        QCOMPARE(pair.service.title, std::string("newer"));
        pair.service.colorRuns.clear();
        pair.service.events.clear();
        pair.server.sendConfiguration({.suggestedColors = alternatingColors(sent)});
        pair.exchange();
        QCOMPARE(static_cast<int>(pair.service.colorRuns.size()), arrived);
        for (int i = 0; i < arrived; ++i)
            QCOMPARE(pair.service.colorRuns[std::size_t(i)], (std::vector{i / 4096.0, 0.1, 0.2, 1.0}));
        QCOMPARE(pair.service.eventsOf("configuration_done").size(), std::size_t(1));
    }

    void aPickArrivesBitForBit()
    {
        constexpr double odd = 0.1 + 0.2;
        constexpr double tiny = std::numeric_limits<double>::denorm_min();
        PresentedPair pair;
        pick(pair.service, {odd, -0.0, 1.5, tiny}, "kTQColorSpaceDisplayP3", "kTQColorSpaceDisplayP3", 1);
        pick(pair.service, {0.25, 0.5}, "kTQColorSpaceGray", nullptr);
        pick(pair.service, {0.1, 0.2, 0.3, 0.4}, "noSuchSpace", "noSuchSpace");
        pick(pair.service, {}, nullptr, nullptr);
        pair.exchange();
        const auto &picks = pair.delegate.picks;
        QCOMPARE(picks.size(), std::size_t(4));
        QCOMPARE(picks[0].color->colorSpace()->name(), std::optional<std::string>("kTQColorSpaceDisplayP3"));
        QCOMPARE(picks[0].color->components()[0], odd);
        QVERIFY(std::signbit(picks[0].color->components()[1]));
        QCOMPARE(picks[0].color->components()[2], 1.5);
        QVERIFY(picks[0].color->alpha() == tiny);
        QVERIFY(picks[0].isVolatile);
        QCOMPARE(picks[0].colorspace, std::optional<std::string>("kTQColorSpaceDisplayP3"));
        QCOMPARE(picks[1].color->components().size(), std::size_t(1));
        QVERIFY(!picks[1].colorspace);
        QVERIFY(!picks[1].isVolatile);
        QVERIFY(!picks[2].color->colorSpace());
        QCOMPARE(picks[2].color->components()[2], 0.3);
        QVERIFY(!picks[3].color);
    }

    void messagesOfTheServiceReachTheDelegate()
    {
        PresentedPair pair;
        favrin_remote_view_v1 *view = pair.service.view;
        favrin_remote_view_v1_ready(view);
        favrin_remote_view_v1_set_preferred_content_size(view, wl_fixed_from_int(16384), 0);
        favrin_remote_view_v1_set_background_effect(view, 1);
        favrin_remote_view_v1_picker_did_show_eyedropper(view);
        favrin_remote_view_v1_picker_did_float_eyedropper(view);
        favrin_remote_view_v1_picker_did_dismiss_eyedropper(view);
        favrin_remote_view_v1_color_picker_did_finish(view);
        pair.server.sendPrepareForDisplay(7);
        pair.server.sendPrepareForDisplay(8);
        favrin_remote_view_v1_prepared(view, 8);
        favrin_remote_view_v1_prepared(view, 7);
        pair.exchange();
        const Lines expected = {"ready",
                                "size 16384.000000 0.000000",
                                "effect 1",
                                "show eyedropper",
                                "float eyedropper",
                                "dismiss eyedropper",
                                "finish",
                                "prepared 8",
                                "prepared 7"};
        QCOMPARE(pair.delegate.calls, expected);
        QCOMPARE(pair.service.eventsOf("prepare"), (Lines{"prepare 7", "prepare 8"}));
    }

    void aWrongRequestEndsTheConnectionWithItsError_data()
    {
        QTest::addColumn<Misuse>("misuse");
        QTest::addColumn<std::string>("error");
        const auto row = [](const char *name, const char *error, Misuse misuse) {
            QTest::newRow(name) << misuse << std::string(error);
        };
        constexpr double nan = std::numeric_limits<double>::quiet_NaN();
        constexpr double infinite = std::numeric_limits<double>::infinity();
        static const std::string longText(257, 'x');
        row("color of three numbers", "favrin_remote_view_v1 0", [](ScriptedService &s) {
            pick(s, {1, 1, 1}, "kTQColorSpaceSRGB", nullptr);
        });
        row("gray of four numbers", "favrin_remote_view_v1 0", [](ScriptedService &s) {
            pick(s, {1, 1, 1, 1}, "kTQColorSpaceGray", nullptr);
        });
        row("color of half a number", "favrin_remote_view_v1 0", [](ScriptedService &s) {
            std::array<char, 28> bytes = {};
            wl_array array = {bytes.size(), 0, bytes.data()};
            favrin_remote_view_v1_picker_did_select_color(s.view, &array, "kTQColorSpaceSRGB", nullptr, 0);
        });
        row("NaN", "favrin_remote_view_v1 0", [](ScriptedService &s) { pick(s, {nan, 0, 0, 1}, nullptr, nullptr); });
        row("infinite alpha", "favrin_remote_view_v1 0", [](ScriptedService &s) {
            pick(s, {0, 0, 0, infinite}, "kTQColorSpaceSRGB", nullptr);
        });
        row("space name too long", "favrin_remote_view_v1 1", [](ScriptedService &s) {
            pick(s, {0, 0, 0, 1}, longText.c_str(), nullptr);
        });
        row("name not UTF-8", "favrin_remote_view_v1 1", [](ScriptedService &s) {
            pick(s, {0, 0, 0, 1}, nullptr, "\xc0\xaf");
        });
        row("volatile twice", "favrin_remote_view_v1 3", [](ScriptedService &s) {
            pick(s, {0, 0, 0, 1}, nullptr, nullptr, 2);
        });
        row("negative size", "favrin_remote_view_v1 2",
            [](ScriptedService &s) { favrin_remote_view_v1_set_preferred_content_size(s.view, -1, 0); });
        row("size too large", "favrin_remote_view_v1 2", [](ScriptedService &s) {
            favrin_remote_view_v1_set_preferred_content_size(s.view, 0, wl_fixed_from_int(16384) + 1);
        });
        row("unknown effect", "favrin_remote_view_v1 3",
            [](ScriptedService &s) { favrin_remote_view_v1_set_background_effect(s.view, 2); });
        row("answer without a question", "favrin_remote_view_v1 5",
            [](ScriptedService &s) { favrin_remote_view_v1_prepared(s.view, 0); });
        row("ready twice", "favrin_remote_view_v1 5", [](ScriptedService &s) {
            favrin_remote_view_v1_ready(s.view);
            favrin_remote_view_v1_ready(s.view);
        });
        row("second bind", "favrin_remote_view_v1 4", [](ScriptedService &s) {
            wl_registry_bind(s.registry, s.globals["favrin_remote_view_v1"].first, &favrin_remote_view_v1_interface, 1);
        });
        row("second bind after a goodbye", "favrin_remote_view_v1 4", [](ScriptedService &s) {
            favrin_remote_view_v1_destroy(std::exchange(s.view, nullptr));
            wl_registry_bind(s.registry, s.globals["favrin_remote_view_v1"].first, &favrin_remote_view_v1_interface, 1);
        });
        row("version that is not offered", "wl_registry 0",
            [](ScriptedService &s) { wl_registry_bind(s.registry, s.globals["wl_shm"].first, &wl_shm_interface, 2); });
        row("buffer before the first configure", "xdg_surface 3", [](ScriptedService &s) {
            s.makeToplevel();
            s.commit(s.makeBuffer(4, 4, 0), 4, 4);
        });
        row("acknowledgement of nothing", "xdg_surface 4", [](ScriptedService &s) {
            s.makeToplevel();
            xdg_surface_ack_configure(s.xdgSurface, 12345);
        });
        row("two toplevels of one surface", "xdg_surface 2", [](ScriptedService &s) {
            s.makeToplevel();
            xdg_surface_get_toplevel(s.xdgSurface);
        });
        row("window as cursor", "wl_pointer 0", [](ScriptedService &s) {
            s.makeToplevel();
            wl_pointer_set_cursor(s.pointer, 0, s.surface, 0, 0);
        });
        row("cursor as window", "xdg_wm_base 0", [](ScriptedService &s) {
            wl_surface *cursor = wl_compositor_create_surface(s.compositor);
            wl_pointer_set_cursor(s.pointer, 0, cursor, 0, 0);
            xdg_wm_base_get_xdg_surface(s.shell, cursor);
        });
        row("scale of nothing", "wl_surface 0", [](ScriptedService &s) {
            s.makeToplevel();
            wl_surface_set_buffer_scale(s.surface, 0);
        });
        row("scale of five", "wl_surface 0", [](ScriptedService &s) {
            s.makeToplevel();
            wl_surface_set_buffer_scale(s.surface, 5);
        });
        row("rotated picture", "wl_surface 1", [](ScriptedService &s) {
            s.makeToplevel();
            wl_surface_set_buffer_transform(s.surface, 1);
        });
        row("negative smallest size", "xdg_toplevel 2", [](ScriptedService &s) {
            s.makeToplevel();
            xdg_toplevel_set_min_size(s.toplevel, -1, 0);
        });
    }
    void aWrongRequestEndsTheConnectionWithItsError()
    {
        QFETCH(Misuse, misuse);
        QFETCH(std::string, error);
        PresentedPair pair;
        pair.service.events.clear();
        misuse(pair.service);
        // What comes after a wrong request is not heard any more.
        if (pair.service.view)
            favrin_remote_view_v1_color_picker_did_finish(pair.service.view);
        pair.exchange();
        QCOMPARE(pair.protocolError(), error);
        QCOMPARE(pair.delegate.closes.size(), std::size_t(1));
        QVERIFY(pair.delegate.closes[0].reason == host::server::CloseReason::ProtocolError);
        const std::string detail = error.substr(0, error.find(' ')) + " error" + error.substr(error.find(' ')) + ": ";
        QVERIFY2(pair.delegate.closes[0].detail.starts_with(detail), pair.delegate.closes[0].detail.c_str());
        QVERIFY(pair.delegate.picks.empty());
        QVERIFY(std::ranges::find(pair.delegate.calls, "finish") == pair.delegate.calls.end());

        // The owner may go on calling a server that has lost its service.
        pair.server.sendPresent();
        pair.server.pointerEnter(1, 1);
        pair.server.configure(5, 5, 2);
        pair.exchange();
        QCOMPARE(pair.delegate.closes.size(), std::size_t(1));
    }

    void anEndOfTheServiceIsToldOnce()
    {
        RecordingDelegate delegate;
        host::server::RemoteViewServer server(delegate);
        {
            ScriptedService service(server.openConnection());
            service.flush();
            server.dispatch();
        }
        server.dispatch();
        server.dispatch();
        QCOMPARE(delegate.closes.size(), std::size_t(1));
        QVERIFY(delegate.closes[0].reason == host::server::CloseReason::ServiceGone);
    }

    void anEndThatSendingNoticesIsToldByTheNextDispatch()
    {
        PresentedPair pair;
        ::shutdown(wl_display_get_fd(pair.service.display), SHUT_RD);
        for (int i = 0; i < 10; ++i)
            pair.server.sendTraits({.locale = "de"});
        pair.server.flush();
        QVERIFY(pair.delegate.closes.empty());
        pair.exchangeUntilClosed();
    }

    void theOwnerMayCloseInsideACall()
    {
        PresentedPair pair;
        pair.delegate.closeOnFinish = &pair.server;
        favrin_remote_view_v1_color_picker_did_finish(pair.service.view);
        favrin_remote_view_v1_picker_did_show_eyedropper(pair.service.view);
        pair.exchange();
        QCOMPARE(pair.delegate.calls, Lines{"finish"});
        QVERIFY(pair.delegate.closes.empty());
        QVERIFY(wl_display_get_error(pair.service.display) != 0);
    }

    void pingTellsOfSilenceOnceAndOfTheAnswer()
    {
        PresentedPair pair;
        pair.delegate.calls.clear();
        pair.server.ping();
        pair.exchange();
        pair.server.ping();
        pair.service.answersPings = false;
        pair.exchange();
        QCOMPARE(pair.delegate.calls, Lines());
        pair.server.ping();
        pair.server.ping();
        QCOMPARE(pair.delegate.calls, Lines{"unresponsive"});
        xdg_wm_base_pong(pair.service.shell, 999999);
        pair.exchange();
        QCOMPARE(pair.delegate.calls, Lines{"unresponsive"});
    }

    void aServiceThatHasNotComeYetIsAskedWhenItCame()
    {
        PresentedPair pair(PresentedPair::Start::Unbound);
        pair.server.ping();
        pair.server.ping();
        QCOMPARE(pair.delegate.calls, Lines{"unresponsive"});
        pair.service.bindAll();
        pair.exchange();
        QVERIFY(std::ranges::find(pair.delegate.calls, "responsive") != pair.delegate.calls.end());
    }

private:
    OpenFiles m_files;
};

QTEST_GUILESS_MAIN(ServerMessagesTest)
#include "tst_servermessages.moc"
