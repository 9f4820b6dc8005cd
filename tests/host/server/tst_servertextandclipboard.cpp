#include "presentedpair.h"

#include "host/server/serverlimits.h"

#include <array>

#include <fcntl.h>

using namespace Qt::StringLiterals;
using Lines = std::vector<std::string>;
using Start = PresentedPair::Start;
using favrin::host::server::TextInputState;

namespace {

/** To read from, and to write to. */
std::array<int, 2> openPipe()
{
    std::array<int, 2> ends = {-1, -1};
    static_cast<void>(!::pipe2(ends.data(), O_CLOEXEC));
    return ends;
}

QByteArray readAll(int descriptor)
{
    QFile file;
    return file.open(descriptor, QIODevice::ReadOnly, QFile::AutoCloseHandle) ? file.readAll() : QByteArray("nothing");
}

wl_data_source *makeSource(ScriptedService &service, const Lines &types)
{
    wl_data_source *source = wl_data_device_manager_create_data_source(service.dataDeviceManager);
    service.listenTo(source);
    for (const std::string &type : types)
        wl_data_source_offer(source, type.c_str());
    return source;
}

} // namespace

class ServerTextAndClipboardTest : public ServerTest
{
    Q_OBJECT

private Q_SLOTS:
    void aTextFieldDescribesItself()
    {
        PresentedPair pair(Start::Mapped);
        zwp_text_input_v1 *input = pair.service.textInput;
        zwp_text_input_v1_activate(input, pair.service.seat, pair.service.surface);
        zwp_text_input_v1_set_surrounding_text(input, "aéz", 99, 2);
        zwp_text_input_v1_set_content_type(input, 0x80, 3);
        zwp_text_input_v1_set_cursor_rectangle(input, 1, 2, 3, 4);
        zwp_text_input_v1_set_preferred_language(input, "cs");
        zwp_text_input_v1_show_input_panel(input);
        zwp_text_input_v1_reset(input);
        zwp_text_input_v1_commit_state(input, 41);
        // Neither is taken: not UTF-8.
        zwp_text_input_v1_set_surrounding_text(input, "\xff", 0, 0);
        zwp_text_input_v1_set_preferred_language(input, "\xff");
        pair.exchange();
        QCOMPARE(pair.delegate.textInputs, (std::vector{TextInputState{.enabled = true,
                                                                       .surroundingText = "aéz",
                                                                       .cursor = 4,
                                                                       .anchor = 1,
                                                                       .contentPurpose = 3,
                                                                       .contentHints = 0x80,
                                                                       .cursorRectangle = {1, 2, 3, 4},
                                                                       .preferredLanguage = "cs",
                                                                       .wantsInputPanel = true,
                                                                       .resets = 1}}));
        zwp_text_input_v1_deactivate(input, pair.service.seat);
        pair.exchange();
        QVERIFY(!pair.delegate.textInputs.back().enabled);
        QCOMPARE(pair.heard("text"), u"enter, input_panel_state 1, leave"_s);
    }

    void theInputMethodWritesIntoTheActiveField()
    {
        PresentedPair pair(Start::Mapped);
        pair.server.commitText("nobody");
        zwp_text_input_v1 *input = pair.service.textInput;
        zwp_text_input_v1_activate(input, pair.service.seat, pair.service.surface);
        zwp_text_input_v1_set_surrounding_text(input, "abcdef", 4, 4);
        zwp_text_input_v1_commit_state(input, 7);
        pair.exchange();
        pair.service.events.clear();
        pair.server.preeditText("pré", 100);
        pair.server.commitText("é");
        pair.server.commitText("\xc3");
        pair.server.deleteSurroundingText(99, 99);
        pair.server.deleteSurroundingText(0, 0);
        pair.exchange();
        QCOMPARE(pair.heard("text"), u"preedit_cursor 4, preedit_string 7 pré pré, commit_string 7 é, "
                                     "delete_surrounding_text -4 6, commit_string 7 "_s);

        // A long text comes in parts that end between characters, and is cut in the end.
        pair.service.events.clear();
        std::string longText = "x";
        while (longText.size() < 20000)
            longText += "é";
        pair.server.commitText(longText);
        pair.exchange();
        std::string received;
        for (const std::string &event : pair.service.eventsOf("text commit_string 7 "))
            received += event.substr(21);
        QCOMPARE(received.size(), favrin::host::server::limits::inputTextBytes - 1);
        QVERIFY(longText.starts_with(received));
    }

    void theHostsClipboardIsOfferedAndRead()
    {
        PresentedPair pair(Start::Mapped);
        Lines types = {"text/plain", "", "\xff", std::string(257, 't')};
        for (int i = 0; i < 40; ++i)
            types.push_back("type/" + std::to_string(i));
        pair.server.setClipboard(types);
        pair.exchange();
        const Lines offered = pair.service.eventsOf("offer");
        QCOMPARE(offered.size(), favrin::host::server::limits::mimeTypes);
        QCOMPARE(offered[0], std::string("offer text/plain"));
        QCOMPARE(offered[1], std::string("offer type/0"));

        pair.delegate.calls.clear();
        const auto wanted = openPipe();
        const auto unknown = openPipe();
        wl_data_offer_receive(pair.service.dataOffer, "text/plain", wanted[1]);
        wl_data_offer_receive(pair.service.dataOffer, "no/such", unknown[1]);
        pair.service.flush();
        ::close(wanted[1]);
        ::close(unknown[1]);
        pair.exchange();
        QCOMPARE(pair.told(), u"wants text/plain"_s);
        QCOMPARE(readAll(wanted[0]), QByteArray("host"));
        QCOMPARE(readAll(unknown[0]), QByteArray());

        pair.server.setClipboard({});
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("selection").back(), std::string("selection none"));
    }

    void manyClipboardsDoNotPileUp()
    {
        PresentedPair pair(Start::Mapped);
        for (int i = 0; i < 1000; ++i) {
            pair.server.setClipboard({"type/" + std::to_string(i)});
            pair.server.flush();
        }
        pair.exchange();
        QVERIFY(pair.service.eventsOf("offer").size() <= favrin::host::server::limits::clipboardOffers);
        // As soon as the service lets one go, it hears of the newest.
        wl_data_offer_destroy(pair.service.dataOffer);
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("offer").back(), std::string("offer type/999"));
        QVERIFY(pair.delegate.closes.empty());
    }

    void theServicesClipboardIsOfferedAndRead()
    {
        PresentedPair pair(Start::Mapped);
        wl_data_source *unasked = makeSource(pair.service, {"text/plain"});
        wl_data_device_set_selection(pair.service.dataDevice, unasked, 0);
        pair.exchange();
        QVERIFY(pair.delegate.offers.empty());
        QCOMPARE(pair.service.eventsOf("cancelled").size(), std::size_t(1));

        pair.server.keyboardEnter();
        pair.server.keyboardKey(1, 46, true);
        pair.exchange();
        wl_data_source *source = makeSource(pair.service, {"text/plain", "text/plain", "text/html"});
        wl_data_device_set_selection(pair.service.dataDevice, source, pair.service.inputSerial);
        pair.exchange();
        QCOMPARE(pair.delegate.offers, (std::vector<Lines>{{"text/plain", "text/html"}}));

        const auto known = openPipe();
        const auto unknown = openPipe();
        pair.server.requestServiceClipboard("text/html", known[1]);
        pair.server.requestServiceClipboard("no/such", unknown[1]);
        pair.exchange();
        QCOMPARE(pair.heard("send"), u"text/html"_s);
        QCOMPARE(readAll(known[0]), QByteArray("service"));
        QCOMPARE(readAll(unknown[0]), QByteArray());

        // The host's clipboard takes its place.
        pair.server.setClipboard({"text/plain"});
        pair.exchange();
        QCOMPARE(pair.service.eventsOf("cancelled").size(), std::size_t(2));
        QCOMPARE(pair.delegate.offers.size(), std::size_t(1));
    }
};

QTEST_GUILESS_MAIN(ServerTextAndClipboardTest)
#include "tst_servertextandclipboard.moc"
