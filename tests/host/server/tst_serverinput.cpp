#include "presentedpair.h"

#include <xkbcommon/xkbcommon-keysyms.h>

using namespace Qt::StringLiterals;
using Start = PresentedPair::Start;

class ServerInputTest : public ServerTest
{
    Q_OBJECT

private Q_SLOTS:
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
        QCOMPARE(pair.heard("pointer"),
                 u"enter 1 2, frame, motion 5 6, button 272 1, frame, "
                 "axis_source 0, axis_discrete 0 1, axis 0 15, frame, "
                 "axis_source 1, axis 1 2, axis_source 1, axis_stop 1, axis_stop 0, leave, frame"_s);
    }

    void positionsThatMakeNoSenseAreHarmless()
    {
        PresentedPair pair(Start::Mapped);
        pair.server.pointerEnter(std::nan(""), std::numeric_limits<double>::infinity());
        pair.server.pointerMotion(1, 1e300, -1e300);
        pair.exchange();
        QCOMPARE(pair.heard("pointer"), u"enter 0 0, motion 8388607 -8388607, frame"_s);
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
        QCOMPARE(pair.heard("configure"), u"20 10 1"_s);
        pair.service.acknowledge();
        pair.service.commit(pair.service.makeBuffer(20, 10, 0), 20, 10);
        pair.exchange();
        QCOMPARE(pair.heard("pointer"), u"enter 4 4, frame"_s);
        QCOMPARE(pair.heard("keyboard"), u"enter 0, modifiers 1 0 2 0, key 30 1"_s);
        QCOMPARE(pair.heard("touch"), QString());
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
        QCOMPARE(pair.service.eventsOf("keyboard key ").size(), std::size_t(128));
        QCOMPARE(pair.heard("keyboard key 16"), QString());
        const QString heard = pair.heard("keyboard");
        QVERIFY2(heard.endsWith(u", key 15 1, key 15 0, modifiers 1 0 0 0, key 30 1, modifiers 0 0 0 0, key 30 0"),
                 qPrintable(heard.right(200)));
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
        QCOMPARE(pair.heard("touch"), u"down 5 1 2, motion 5 3 4, frame, up 5, down 0 1 1, cancel"_s);
    }

    void theKeyboardIsOfferedWithItsKeymap()
    {
        PresentedPair pair(Start::Unbound);
        pair.service.bindAll();
        pair.exchange();
        // Pointer and touch, then the keyboard too.
        QCOMPARE(pair.heard("seat capabilities"), u"5"_s);
        pair.server.setKeymap("");
        pair.server.setKeymapFromNames("", "", "de", "", "");
        pair.exchange();
        QCOMPARE(pair.heard("seat capabilities"), u"5, 7"_s);
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
        QCOMPARE(pair.heard("keyboard"), u"keymap 1, repeat_info 0 250"_s);
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
        QCOMPARE(pair.heard("keyboard keymap"), u"1"_s);
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
        QCOMPARE(pair.heard("keyboard"), u"enter 0, modifiers 0 0 0 0, key 30 1, modifiers 4 0 0 1, key 30 0, leave"_s);
    }

    void theCursorIsShownOrHidden()
    {
        PresentedPair pair(Start::Mapped);
        pair.delegate.calls.clear();
        wl_surface *cursor = wl_compositor_create_surface(pair.service.compositor);
        wl_pointer_set_cursor(pair.service.pointer, 0, cursor, 0, 0);
        pair.exchange();
        QCOMPARE(pair.told(), QString());
        pair.server.pointerEnter(1, 1);
        wl_pointer_set_cursor(pair.service.pointer, 1, cursor, 0, 0);
        wl_pointer_set_cursor(pair.service.pointer, 1, cursor, 3, 3);
        wl_pointer_set_cursor(pair.service.pointer, 1, nullptr, 0, 0);
        // The picture of a cursor is never a frame of the picker.
        const std::size_t frames = pair.delegate.frames.size();
        wl_surface_attach(cursor, pair.service.makeBuffer(8, 8, 0), 0, 0);
        wl_surface_commit(cursor);
        pair.exchange();
        QCOMPARE(pair.told(), u"cursor default, cursor "_s);
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
        QVERIFY(pair.service.eventsOf("pointer").size() < 3000);
        const QString pointers = pair.heard("pointer");
        QVERIFY2(pointers.contains(u"motion 10000 0, button 272 1, "), qPrintable(pointers.right(200)));
        QVERIFY2(pointers.endsWith(u"motion 10002 0, frame"), qPrintable(pointers.right(200)));
        const QString touches = pair.heard("touch");
        QVERIFY2(touches.endsWith(u"motion 1 10000 0, up 1, frame"), qPrintable(touches.right(200)));
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
        QVERIFY(pair.delegate.isClosedFor(favrin::host::server::CloseReason::LimitExceeded));
    }
};

QTEST_GUILESS_MAIN(ServerInputTest)
#include "tst_serverinput.moc"
