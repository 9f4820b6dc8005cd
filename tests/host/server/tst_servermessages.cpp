#include "presentedpair.h"

#include "../../shared/table.h"
#include "remote/limits.h"

#include <cmath>
#include <limits>

#include <sys/socket.h>

using namespace favrin;
using namespace Qt::StringLiterals;
using host::server::CloseReason;
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

using Misuse = std::function<void(ScriptedService &)>;

void pick(ScriptedService &service, std::vector<double> numbers, const char *space, const char *colorspace,
          std::uint32_t isVolatile = 0)
{
    wl_array array = {numbers.size() * sizeof(double), 0, numbers.data()};
    favrin_remote_view_v1_picker_did_select_color(service.view, &array, space, colorspace, isVolatile);
}

} // namespace

class ServerMessagesTest : public ServerTest
{
    Q_OBJECT

private Q_SLOTS:
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
        QCOMPARE(pair.told(), QString());
        QStringList heard;
        for (const std::string &event : pair.service.events) {
            if (!event.starts_with("keyboard") && !event.starts_with("seat") && !event.starts_with("selection"))
                heard << QString::fromStdString(event);
        }
        QCOMPARE(
            heard.join(u", "),
            u"presentation_context 0, appearance 2, layout_direction 0, text_size_category 3, display 0 , "
            "locale cs-CZ, accessibility_options 1, traits_done, title Nové, options 36, grid_style 0, host_window, "
            "configuration_done, set_selected_color kTQColorSpaceGray kTQColorSpaceDisplayP3, present"_s);
        QCOMPARE(pair.service.numbers["host_window"].back(), (std::vector{1024.0, 0.0, 0.0}));
        QCOMPARE(pair.service.numbers["set_selected_color"], (std::vector<std::vector<double>>{{0.0, 1.0}}));
    }

    void suggestedColorsArriveThoughTheServiceIsBusy_data()
    {
        addRows<int, int, bool>({
            {"none", 0, 0, false},
            {"a thousand", 1000, 1000, false},
            {"the most, each in a message of its own", 2048, 2048, false},
            {"too many", 3000, 2048, true},
        });
    }
    void suggestedColorsArriveThoughTheServiceIsBusy()
    {
        const auto [sent, arrived, isCut] = row<int, int, bool>();
        PresentedPair pair;
        // Nobody reads in the meantime, and the host goes on talking.
        for (int i = 0; i < 100; ++i) {
            pair.server.sendConfiguration({.title = "newer", .suggestedColors = alternatingColors(sent)});
            pair.server.flush();
        }
        pair.exchange();
        QCOMPARE(!pair.delegate.warnings.empty(), isCut);
        QVERIFY(pair.delegate.closes.empty());
        QCOMPARE(pair.service.eventsOf("title").back(), std::string("title newer"));
        pair.service.numbers.clear();
        pair.service.events.clear();
        pair.server.sendConfiguration({.suggestedColors = alternatingColors(sent)});
        pair.exchange();
        const auto &colors = pair.service.numbers["suggested_colors"];
        QCOMPARE(static_cast<int>(colors.size()), arrived);
        for (int i = 0; i < arrived; ++i)
            QCOMPARE(colors[std::size_t(i)], (std::vector{i / 4096.0, 0.1, 0.2, 1.0}));
        QCOMPARE(pair.service.eventsOf("configuration_done").size(), std::size_t(1));
    }

    void aPickArrivesBitForBit()
    {
        using platform::Color;
        using platform::ColorSpace;
        constexpr double tiny = std::numeric_limits<double>::denorm_min();
        const std::array odd = {0.1 + 0.2, -0.0, 1.5};
        const std::string wide = "kTQColorSpaceDisplayP3";
        PresentedPair pair;
        pick(pair.service, {odd[0], odd[1], odd[2], tiny}, wide.c_str(), wide.c_str(), 1);
        pick(pair.service, {0.25, 0.5}, "kTQColorSpaceGray", nullptr);
        pick(pair.service, {odd[0], odd[1], odd[2], 0.4}, "noSuchSpace", "noSuchSpace");
        pick(pair.service, {}, nullptr, nullptr);
        pair.exchange();
        QCOMPARE(pair.delegate.picks,
                 (std::vector<RecordingDelegate::Pick>{{Color(ColorSpace::displayP3(), odd, tiny), wide, true},
                                                       {Color(ColorSpace::gray(), std::array{0.25}, 0.5), {}, false},
                                                       {Color(std::nullopt, odd, 0.4), "noSuchSpace", false},
                                                       {{}, {}, false}}));
        QVERIFY(std::signbit(pair.delegate.picks[0].color->components()[1]));
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
        QCOMPARE(pair.told(), u"ready, size 16384 0, effect 1, show eyedropper, float eyedropper, "
                              "dismiss eyedropper, finish, prepared 8, prepared 7"_s);
        QCOMPARE(pair.heard("prepare_for_display"), u"7, 8"_s);
    }

    void aWrongRequestEndsTheConnectionWithItsError_data()
    {
        constexpr double nan = std::numeric_limits<double>::quiet_NaN();
        constexpr double infinite = std::numeric_limits<double>::infinity();
        const char *const sRGB = "kTQColorSpaceSRGB";
        static const std::string longText(257, 'x');
        const std::string view = "favrin_remote_view_v1 ";
        const auto bindAgain = [](auto &s) {
            wl_registry_bind(s.registry, s.globals["favrin_remote_view_v1"].first, &favrin_remote_view_v1_interface, 1);
        };
        addRows<Misuse, std::string>({
            {"color of three numbers",
             [=](auto &s) {
                 pick(s, {1, 1, 1}, sRGB, nullptr);
             },
             view + "0"},
            {"gray of four numbers",
             [](auto &s) {
                 pick(s, {1, 1, 1, 1}, "kTQColorSpaceGray", nullptr);
             },
             view + "0"},
            {"color of half a number",
             [=](auto &s) {
                 std::array<char, 28> bytes = {};
                 wl_array array = {bytes.size(), 0, bytes.data()};
                 favrin_remote_view_v1_picker_did_select_color(s.view, &array, sRGB, nullptr, 0);
             },
             view + "0"},
            {"NaN",
             [](auto &s) {
                 pick(s, {nan, 0, 0, 1}, nullptr, nullptr);
             },
             view + "0"},
            {"infinite alpha",
             [=](auto &s) {
                 pick(s, {0, 0, 0, infinite}, sRGB, nullptr);
             },
             view + "0"},
            {"space name too long",
             [](auto &s) {
                 pick(s, {0, 0, 0, 1}, longText.c_str(), nullptr);
             },
             view + "1"},
            {"name not UTF-8",
             [](auto &s) {
                 pick(s, {0, 0, 0, 1}, nullptr, "\xc0\xaf");
             },
             view + "1"},
            {"volatile twice",
             [](auto &s) {
                 pick(s, {0, 0, 0, 1}, nullptr, nullptr, 2);
             },
             view + "3"},
            {"negative size", [](auto &s) { favrin_remote_view_v1_set_preferred_content_size(s.view, -1, 0); },
             view + "2"},
            {"size too large",
             [](auto &s) { favrin_remote_view_v1_set_preferred_content_size(s.view, 0, wl_fixed_from_int(16384) + 1); },
             view + "2"},
            {"unknown effect", [](auto &s) { favrin_remote_view_v1_set_background_effect(s.view, 2); }, view + "3"},
            {"answer without a question", [](auto &s) { favrin_remote_view_v1_prepared(s.view, 0); }, view + "5"},
            {"ready twice",
             [](auto &s) {
                 favrin_remote_view_v1_ready(s.view);
                 favrin_remote_view_v1_ready(s.view);
             },
             view + "5"},
            {"second bind", bindAgain, view + "4"},
            {"second bind after a goodbye",
             [=](auto &s) {
                 favrin_remote_view_v1_destroy(std::exchange(s.view, nullptr));
                 bindAgain(s);
             },
             view + "4"},
            {"version that is not offered",
             [](auto &s) { wl_registry_bind(s.registry, s.globals["wl_shm"].first, &wl_shm_interface, 2); },
             "wl_registry 0"},
            {"buffer before the first configure", [](auto &s) { s.commit(s.makeBuffer(4, 4, 0), 4, 4); },
             "xdg_surface 3"},
            {"acknowledgement of nothing", [](auto &s) { xdg_surface_ack_configure(s.xdgSurface, 12345); },
             "xdg_surface 4"},
            {"two toplevels of one surface", [](auto &s) { xdg_surface_get_toplevel(s.xdgSurface); }, "xdg_surface 2"},
            {"window as cursor", [](auto &s) { wl_pointer_set_cursor(s.pointer, 0, s.surface, 0, 0); }, "wl_pointer 0"},
            {"cursor as window",
             [](auto &s) {
                 wl_surface *cursor = wl_compositor_create_surface(s.compositor);
                 wl_pointer_set_cursor(s.pointer, 0, cursor, 0, 0);
                 xdg_wm_base_get_xdg_surface(s.shell, cursor);
             },
             "xdg_wm_base 0"},
            {"scale of nothing", [](auto &s) { wl_surface_set_buffer_scale(s.surface, 0); }, "wl_surface 0"},
            {"scale of five", [](auto &s) { wl_surface_set_buffer_scale(s.surface, 5); }, "wl_surface 0"},
            {"rotated picture", [](auto &s) { wl_surface_set_buffer_transform(s.surface, 1); }, "wl_surface 1"},
            {"negative smallest size", [](auto &s) { xdg_toplevel_set_min_size(s.toplevel, -1, 0); }, "xdg_toplevel 2"},
        });
    }
    void aWrongRequestEndsTheConnectionWithItsError()
    {
        const auto [misuse, error] = row<Misuse, std::string>();
        PresentedPair pair;
        pair.service.makeToplevel();
        misuse(pair.service);
        // What comes after a wrong request is not heard any more.
        if (pair.service.view)
            favrin_remote_view_v1_color_picker_did_finish(pair.service.view);
        pair.exchange();
        QCOMPARE(pair.protocolError(), error);
        QVERIFY(pair.delegate.isClosedFor(CloseReason::ProtocolError));
        const std::string detail = error.substr(0, error.find(' ')) + " error" + error.substr(error.find(' ')) + ": ";
        QVERIFY2(pair.delegate.closes[0].detail.starts_with(detail), pair.delegate.closes[0].detail.c_str());
        QVERIFY(pair.delegate.picks.empty());
        QVERIFY(!pair.delegate.calls.contains(u"finish"));

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
        QVERIFY(delegate.isClosedFor(CloseReason::ServiceGone));
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
        QCOMPARE(pair.told(), u"finish"_s);
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
        QCOMPARE(pair.told(), QString());
        pair.server.ping();
        pair.server.ping();
        xdg_wm_base_pong(pair.service.shell, 999999);
        pair.exchange();
        QCOMPARE(pair.told(), u"unresponsive"_s);
    }

    void aServiceThatHasNotComeYetIsAskedWhenItCame()
    {
        PresentedPair pair(Start::Unbound);
        pair.server.ping();
        pair.server.ping();
        QCOMPARE(pair.told(), u"unresponsive"_s);
        pair.service.bindAll();
        pair.exchange();
        QVERIFY(pair.delegate.calls.contains(u"responsive"));
    }
};

QTEST_GUILESS_MAIN(ServerMessagesTest)
#include "tst_servermessages.moc"
