#include "remote/client/remoteviewevents.h"

#include "favrin-remote-view-v1-client-protocol.h"
#include "remote/limits.h"
#include "remote/sanitized.h"
#include "remote/wirecolor.h"
#include "remote/wireoptions.h"
#include "remote/wiretext.h"

#include <span>
#include <utility>

namespace favrin::remote::client {

namespace {

std::span<const std::byte> bytes(const wl_array *array)
{
    return {static_cast<const std::byte *>(array->data), array->size};
}

std::optional<std::string> optionalText(const char *text)
{
    if (!text)
        return std::nullopt;
    // A text that is no text is treated like one that is missing.
    return sendableText(text, limits::textBytes);
}

} // namespace

struct RemoteViewEvents::Handlers
{
    static RemoteViewEvents &self(void *data) { return *static_cast<RemoteViewEvents *>(data); }

    // Enum values travel as they come: sanitized() decides what becomes of unknown ones.
    static void presentationContext(void *data, favrin_remote_view_v1 *, uint32_t context)
    {
        self(data).m_traits.presentationContext = static_cast<PresentationContext>(context);
    }
    static void appearance(void *data, favrin_remote_view_v1 *, uint32_t appearance)
    {
        self(data).m_traits.appearance = static_cast<Appearance>(appearance);
    }
    static void layoutDirection(void *data, favrin_remote_view_v1 *, uint32_t direction)
    {
        self(data).m_traits.layoutDirection = static_cast<LayoutDirection>(direction);
    }
    static void textSizeCategory(void *data, favrin_remote_view_v1 *, uint32_t category)
    {
        self(data).m_traits.textSizeCategory = static_cast<TextSizeCategory>(category);
    }
    static void display(void *data, favrin_remote_view_v1 *, uint32_t gamut, const char *identifier)
    {
        self(data).m_traits.displayGamut = static_cast<DisplayGamut>(gamut);
        self(data).m_traits.displayIdentifier = identifier;
    }
    static void locale(void *data, favrin_remote_view_v1 *, const char *name) { self(data).m_traits.locale = name; }
    static void accessibilityOptions(void *data, favrin_remote_view_v1 *, uint32_t options)
    {
        applyAccessibilityBits(options, self(data).m_traits);
    }
    static void traitsDone(void *data, favrin_remote_view_v1 *)
    {
        auto &events = self(data);
        events.m_traits = sanitized(events.m_traits);
        events.m_receiver.traitsDidArrive(events.m_traits);
    }

    static void title(void *data, favrin_remote_view_v1 *, const char *title) { self(data).m_title = title; }
    static void suggestedColors(void *data, favrin_remote_view_v1 *, const char *space, wl_array *colors)
    {
        auto &list = self(data).m_suggestedColors;
        const auto run = decodeColorRun(bytes(colors), space);
        if (run && list.size() + run->size() <= limits::suggestedColors)
            list.insert(list.end(), run->begin(), run->end());
    }
    static void options(void *data, favrin_remote_view_v1 *, uint32_t options)
    {
        applyOptionBits(options, self(data).m_configuration);
    }
    static void gridStyle(void *data, favrin_remote_view_v1 *, int32_t style)
    {
        self(data).m_configuration.userInterfaceStyleForGrid = style;
    }
    static void hostWindow(void *data, favrin_remote_view_v1 *, wl_array *geometry)
    {
        const auto values = decodeNumbers(bytes(geometry), 3);
        if (!values)
            return;
        auto &configuration = self(data).m_configuration;
        configuration.hostWindowWidth = (*values)[0];
        configuration.hostWindowHeight = (*values)[1];
        configuration.keyboardSpace = (*values)[2];
    }
    static void configurationDone(void *data, favrin_remote_view_v1 *) { self(data).finishConfiguration(); }

    static void setSelectedColor(void *data, favrin_remote_view_v1 *, wl_array *color, const char *space,
                                 const char *colorspace)
    {
        const auto spaceName = optionalText(space);
        const auto decoded = decodeColor(bytes(color), spaceName);
        // A color that makes no sense is no message at all: the picker keeps what it has.
        if (decoded)
            self(data).m_receiver.selectedColorDidArrive(*decoded, optionalText(colorspace));
    }
    static void prepareForDisplay(void *data, favrin_remote_view_v1 *, uint32_t serial)
    {
        self(data).m_receiver.prepareForDisplayDidArrive(serial);
    }
    static void present(void *data, favrin_remote_view_v1 *) { self(data).m_receiver.presentDidArrive(); }
    static void focusWillEnter(void *data, favrin_remote_view_v1 *, uint32_t direction)
    {
        // A direction that nobody knows comes from the front.
        const bool backward = direction == FAVRIN_REMOTE_VIEW_V1_FOCUS_DIRECTION_BACKWARD;
        self(data).m_receiver.focusWillEnterDidArrive(backward ? FocusDirection::Backward : FocusDirection::Forward);
    }
    static void colorPickerDidFinish(void *data, favrin_remote_view_v1 *)
    {
        self(data).m_receiver.colorPickerDidFinishDidArrive();
    }
};

RemoteViewEvents::RemoteViewEvents(RemoteViewEventsReceiver &receiver) : m_receiver(receiver) {}

void RemoteViewEvents::finishConfiguration()
{
    auto configuration = std::exchange(m_configuration, {});
    auto title = std::exchange(m_title, {});
    auto suggestedColors = std::exchange(m_suggestedColors, {});
    if (configuration.title)
        configuration.title = std::move(title);
    if (configuration.suggestedColors)
        configuration.suggestedColors = std::move(suggestedColors);
    m_receiver.configurationDidArrive(sanitized(configuration));
}

const favrin_remote_view_v1_listener &RemoteViewEvents::listener()
{
    static const favrin_remote_view_v1_listener listener = {
        .presentation_context = Handlers::presentationContext,
        .appearance = Handlers::appearance,
        .layout_direction = Handlers::layoutDirection,
        .text_size_category = Handlers::textSizeCategory,
        .display = Handlers::display,
        .locale = Handlers::locale,
        .accessibility_options = Handlers::accessibilityOptions,
        .traits_done = Handlers::traitsDone,
        .title = Handlers::title,
        .suggested_colors = Handlers::suggestedColors,
        .options = Handlers::options,
        .grid_style = Handlers::gridStyle,
        .host_window = Handlers::hostWindow,
        .configuration_done = Handlers::configurationDone,
        .set_selected_color = Handlers::setSelectedColor,
        .prepare_for_display = Handlers::prepareForDisplay,
        .present = Handlers::present,
        .focus_will_enter = Handlers::focusWillEnter,
        .color_picker_did_finish = Handlers::colorPickerDidFinish,
    };
    return listener;
}

} // namespace favrin::remote::client
