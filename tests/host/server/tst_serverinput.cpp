#include "presentedpair.h"

#include <xkbcommon/xkbcommon-keysyms.h>

using Lines = std::vector<std::string>;
using Start = PresentedPair::Start;

class ServerInputTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_files.remember(); }
    void cleanup() { m_files.check(); }

    void thePointerReachesTheSurface()
    {
        PresentedPair pair(Start::Mapped);
        auto &server = pair.server;
        server.pointerMotion(1, 3, 3);
        server.pointerEnter(1, 2);
        server.pointerFrame();
        server.pointerMotion(2, 5, 6);
        server.pointerButton(3, 0x110, true);
        server.pointerFrame();
        server.pointerAxis(4, 0, 15, 0, 1);
        server.pointerFrame();
        server.pointerAxis(5, 2, 0, 0, 0);
        server.pointerAxis(6, 0, 0, 0, 0);
        server.pointerLeave();
        pair.exchange();
        server.pointerButton(7, 0x110, false);
        pair.exchange();
        const Lines expected = {"pointer enter 1 2", "pointer frame",    "pointer motion 5 6",   "pointer button 272 1",
                                "pointer frame",     "pointer source 0", "pointer discrete 0 1", "pointer axis 0 15",
                                "pointer frame",     "pointer source 1", "pointer axis 1 2",     "pointer source 1",
                                "pointer stop 1",    "pointer stop 0",   "pointer leave",        "pointer frame"};
        QCOMPARE(pair.service.eventsOf("pointer"), expected);
    }

    void positionsThatMakeNoSenseAreHarmless()
    {
        PresentedPair pair(Start::Mapped);
        pair.server.pointerEnter(std::nan(""), std::numeric_limits<double>::infinity());
        pair.server.pointerMotion(1, 1e300, -1e300);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("pointer"),
                 (Lines{"pointer enter 0 0", "pointer motion 8388607 -8388607", "pointer frame"}));
    }

    void inputMeantForThePickerWaitsForItsSurface()
    {
        PresentedPair pair;
        pair.server.pointerEnter(4, 4);
        pair.server.keyboardEnter();
        pair.server.keyboardModifiers(1, 0, 2, 0);
        pair.server.keyboardKey(1, 30, true);
        pair.server.touchDown(1, 0, 1, 1);
        pair.service.events.clear();
        pair.service.makeToplevel();
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("configure"), Lines{"configure 20 10 1"});
        pair.service.acknowledge();
        pair.service.commit(pair.service.makeBuffer(20, 10, 0), 20, 10);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("pointer"), (Lines{"pointer enter 4 4", "pointer frame"}));
        QCOMPARE(pair.service.eventsOf("keyboard"),
                 (Lines{"keyboard enter 0", "keyboard modifiers 1 0 2 0", "keyboard key 30 1"}));
        QVERIFY(pair.service.eventsOf("touch").empty());
    }

    void keysWaitForThePickersKeyboard()
    {
        PresentedPair pair(Start::Unbound);
        auto &server = pair.server;
        server.keyboardEnter();
        server.keyboardKey(1, 16, true);
        server.keyboardLeave();
        server.keyboardEnter();
        for (std::uint32_t time = 0; time < 1000; ++time)
            server.keyboardKey(time, 15, time % 2 == 0);
        server.keyboardModifiers(1, 0, 0, 0);
        server.keyboardKey(1000, 30, true);
        server.keyboardModifiers(0, 0, 0, 0);
        server.keyboardKey(1001, 30, false);
        pair.service.bindAll();
        pair.service.makeToplevel();
        pair.exchange();
        pair.service.acknowledge();
        pair.service.commit(pair.service.makeBuffer(20, 10, 0), 20, 10);
        pair.exchange();
        // Of keys without end the newest; and none that was meant for another place.
        Lines events = pair.service.eventsOf("keyboard");
        QCOMPARE(pair.service.eventsOf("keyboard key ").size(), std::size_t(128));
        QCOMPARE(pair.service.eventsOf("keyboard key 16").size(), std::size_t(0));
        QCOMPARE(Lines(events.end() - 6, events.end()),
                 (Lines{"keyboard key 15 1", "keyboard key 15 0", "keyboard modifiers 1 0 0 0", "keyboard key 30 1",
                        "keyboard modifiers 0 0 0 0", "keyboard key 30 0"}));
    }

    void touchesKeepTheirOrderAndTheirFingers()
    {
        PresentedPair pair(Start::Mapped);
        auto &server = pair.server;
        server.touchDown(1, 5, 1, 2);
        server.touchDown(1, 5, 9, 9);
        server.touchMotion(2, 6, 9, 9);
        server.touchMotion(2, 5, 3, 4);
        server.touchFrame();
        server.touchUp(3, 5);
        server.touchUp(3, 5);
        server.touchDown(4, 0, 1, 1);
        server.touchCancel();
        server.touchUp(5, 0);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("touch"), (Lines{"touch down 5 1 2", "touch motion 5 3 4", "touch frame",
                                                        "touch up 5", "touch down 0 1 1", "touch cancel"}));
    }

    void theKeyboardIsOfferedWithItsKeymap()
    {
        PresentedPair pair(Start::Unbound);
        pair.service.bindAll();
        pair.exchange();
        const std::string pointerAndTouch = "seat offers 5";
        const std::string keyboardToo = "seat offers 7";
        QCOMPARE(pair.service.eventsOf("seat"), Lines{pointerAndTouch});
        pair.server.setKeymap("");
        pair.server.setKeymapFromNames("", "", "de", "", "");
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("seat"), (Lines{pointerAndTouch, keyboardToo}));
    }

    void theKeyboardSaysWhatTheKeysMean()
    {
        PresentedPair pair(Start::Unbound);
        pair.server.setKeymapFromNames("", "", "de", "", "");
        pair.server.setRepeat(-3, 250);
        pair.service.bindAll();
        pair.exchange();
        QVERIFY(pair.service.keymap.starts_with("xkb_keymap"));
        QVERIFY(!pair.service.keymapIsWritable);
        QCOMPARE(pair.service.eventsOf("keyboard"), (Lines{"keyboard keymap 1", "keyboard repeat 0 250"}));
        // On a German keyboard, "z" is where others have "y".
        constexpr std::uint32_t keyY = 21;
        QCOMPARE(pair.server.keyCodeForKeysym(XKB_KEY_z)->key, keyY);
        QCOMPARE(pair.server.keyCodeForKeysym(XKB_KEY_z)->modifiers, 0u);
        QCOMPARE(pair.server.keyCodeForKeysym(XKB_KEY_Z)->modifiers, 1u);
        QVERIFY(!pair.server.keyCodeForKeysym(XKB_KEY_Arabic_kasra));

        const std::string german = pair.service.keymap;
        pair.server.setKeymap("no keymap at all");
        pair.server.setKeymap(std::string(2 * 1024 * 1024, ' '));
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("keyboard keymap").size(), std::size_t(1));
        pair.server.setKeymap("");
        pair.exchange();
        QVERIFY(pair.service.keymap != german);
        pair.server.setKeymap(german);
        pair.exchange();
        QCOMPARE(pair.service.keymap, german);
        QVERIFY(pair.delegate.closes.empty());
    }

    void keysGoWhereTheFocusIs()
    {
        PresentedPair pair(Start::Mapped);
        auto &server = pair.server;
        server.keyboardKey(1, 30, true);
        server.keyboardEnter();
        server.keyboardKey(2, 30, true);
        server.keyboardModifiers(4, 0, 0, 1);
        server.keyboardKey(3, 30, false);
        server.keyboardLeave();
        server.keyboardModifiers(0, 0, 0, 0);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("keyboard"),
                 (Lines{"keyboard enter 0", "keyboard modifiers 0 0 0 0", "keyboard key 30 1",
                        "keyboard modifiers 4 0 0 1", "keyboard key 30 0", "keyboard leave"}));
    }

    void theCursorIsShownOrHidden()
    {
        PresentedPair pair(Start::Mapped);
        pair.delegate.calls.clear();
        wl_surface *cursor = wl_compositor_create_surface(pair.service.compositor);
        wl_pointer_set_cursor(pair.service.pointer, 0, cursor, 0, 0);
        pair.exchange();
        QVERIFY(pair.delegate.calls.empty());
        pair.server.pointerEnter(1, 1);
        wl_pointer_set_cursor(pair.service.pointer, 1, cursor, 0, 0);
        wl_pointer_set_cursor(pair.service.pointer, 1, cursor, 3, 3);
        wl_pointer_set_cursor(pair.service.pointer, 1, nullptr, 0, 0);
        // The picture of a cursor is never a frame of the picker.
        const std::size_t frames = pair.delegate.frames.size();
        wl_surface_attach(cursor, pair.service.makeBuffer(8, 8, 0), 0, 0);
        wl_surface_commit(cursor);
        pair.exchange();
        QCOMPARE(pair.delegate.calls, (Lines{"cursor default", "cursor "}));
        QCOMPARE(pair.delegate.frames.size(), frames);
        QCOMPARE(pair.service.eventsOf("release").size(), std::size_t(1));
    }

    void motionNobodyReadsIsHeldBack()
    {
        PresentedPair pair(Start::Mapped);
        auto &server = pair.server;
        server.pointerEnter(0, 0);
        server.touchDown(0, 1, 0, 0);
        for (int i = 1; i <= 10000; ++i) {
            server.pointerMotion(std::uint32_t(i), i, 0);
            server.pointerFrame();
            server.touchMotion(std::uint32_t(i), 1, i, 0);
            server.touchFrame();
            server.flush();
        }
        server.pointerButton(10001, 0x110, true);
        server.touchUp(10001, 1);
        server.pointerMotion(10002, 10002, 0);
        server.flush();
        pair.exchange();
        QVERIFY(pair.delegate.closes.empty());
        const Lines pointers = pair.service.eventsOf("pointer");
        const Lines touches = pair.service.eventsOf("touch");
        QVERIFY(pointers.size() < 3000);
        const auto button = std::ranges::find(pointers, "pointer button 272 1");
        QVERIFY(button != pointers.end());
        QCOMPARE(*(button - 1), std::string("pointer motion 10000 0"));
        QCOMPARE(*(pointers.end() - 2), std::string("pointer motion 10002 0"));
        QCOMPARE((Lines{touches.end() - 3, touches.end()}),
                 (Lines{"touch motion 1 10000 0", "touch up 1", "touch frame"}));
    }

    void aServiceThatNeverReadsIsLetGo()
    {
        PresentedPair pair(Start::Mapped);
        pair.server.keyboardEnter();
        int keys = 0;
        while (pair.delegate.closes.empty() && keys < 100000) {
            pair.server.keyboardKey(std::uint32_t(keys), 30, keys % 2 == 0);
            pair.server.flush();
            if (++keys % 1000 == 0)
                pair.server.dispatch();
        }
        QVERIFY(keys > 1000);
        QCOMPARE(pair.delegate.closes.size(), std::size_t(1));
        QVERIFY(pair.delegate.closes[0].reason == favrin::host::server::CloseReason::LimitExceeded);
    }

private:
    OpenFiles m_files;
};

QTEST_GUILESS_MAIN(ServerInputTest)
#include "tst_serverinput.moc"
