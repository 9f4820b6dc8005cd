#include "fuzzinput.h"
#include "remote/client/remoteviewevents.h"
#include "remote/limits.h"
#include "remote/sanitized.h"
#include "remote/wirecolor.h"

#include "favrin-remote-view-v1-client-protocol.h"

#include <array>
#include <cmath>

using namespace favrin::remote;
using client::RemoteViewEvents;

namespace {

/** What the service's front would be told. */
class Receiver : public client::RemoteViewEventsReceiver
{
public:
    void traitsDidArrive(const Traits &traits) override { require(sanitized(traits) == traits, "traits are sane"); }
    void configurationDidArrive(const Configuration &configuration) override
    {
        require(sanitized(configuration) == configuration, "a configuration is sane");
        require(!configuration.suggestedColors || configuration.suggestedColors->size() <= limits::suggestedColors,
                "suggested colors are limited");
    }
    void selectedColorDidArrive(const std::optional<favrin::platform::Color> &color,
                                const std::optional<std::string> &) override
    {
        require(!color || isFinite(*color), "a color is finite");
    }
    void prepareForDisplayDidArrive(std::uint32_t) override {}
    void presentDidArrive() override {}
    void focusWillEnterDidArrive(FocusDirection) override {}
    void colorPickerDidFinishDidArrive() override {}
};

wl_array arrayOf(std::span<const std::uint8_t> bytes)
{
    return {bytes.size(), bytes.size(), const_cast<std::uint8_t *>(bytes.data())};
}

void sendEvent(FuzzInput &input, RemoteViewEvents &events)
{
    const auto &to = RemoteViewEvents::listener();
    // Texts as the library hands them out: they end at their first zero.
    const auto text = [&input] { return input.text(4); };
    switch (input.number<std::uint8_t>() % 19) {
    case 0:
        return to.presentation_context(&events, nullptr, input.number<std::uint32_t>());
    case 1:
        return to.appearance(&events, nullptr, input.number<std::uint32_t>());
    case 2:
        return to.layout_direction(&events, nullptr, input.number<std::uint32_t>());
    case 3:
        return to.text_size_category(&events, nullptr, input.number<std::uint32_t>());
    case 4:
        return to.display(&events, nullptr, input.number<std::uint32_t>(), text().c_str());
    case 5:
        return to.locale(&events, nullptr, text().c_str());
    case 6:
        return to.accessibility_options(&events, nullptr, input.number<std::uint32_t>());
    case 7:
        return to.traits_done(&events, nullptr);
    case 8:
        return to.title(&events, nullptr, input.text(16).c_str());
    case 9: {
        auto colors = arrayOf(input.run(32));
        return to.suggested_colors(&events, nullptr, text().c_str(), &colors);
    }
    case 10:
        return to.options(&events, nullptr, input.number<std::uint32_t>());
    case 11:
        return to.grid_style(&events, nullptr, input.number<std::int32_t>());
    case 12: {
        auto geometry = arrayOf(input.run());
        return to.host_window(&events, nullptr, &geometry);
    }
    case 13:
        return to.configuration_done(&events, nullptr);
    case 14: {
        auto color = arrayOf(input.run());
        const auto space = text();
        return to.set_selected_color(&events, nullptr, &color, space.empty() ? nullptr : space.c_str(), nullptr);
    }
    case 15:
        return to.prepare_for_display(&events, nullptr, input.number<std::uint32_t>());
    case 16:
        return to.present(&events, nullptr);
    case 17:
        return to.focus_will_enter(&events, nullptr, input.number<std::uint32_t>());
    default:
        return to.color_picker_did_finish(&events, nullptr);
    }
}

} // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    Receiver receiver;
    RemoteViewEvents events(receiver);
    for (FuzzInput input(data, size); !input.isEmpty();)
        sendEvent(input, events);
    return 0;
}
