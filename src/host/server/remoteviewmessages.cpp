#include "host/server/remoteviewmessages.h"

#include "favrin-remote-view-v1-server-protocol.h"
#include "remote/limits.h"
#include "remote/wireoptions.h"
#include "remote/wiretext.h"

#include <array>
#include <span>

namespace favrin::host::server {

namespace {

/** A borrowed view of numbers as the wire's array type, which is only read. */
wl_array arrayOf(std::span<const double> numbers)
{
    return {numbers.size_bytes(), 0, const_cast<double *>(numbers.data())};
}

const char *orNull(const std::optional<std::string> &text)
{
    return text ? text->c_str() : nullptr;
}

std::optional<std::string> sendable(const std::optional<std::string> &text)
{
    return text ? remote::sendableText(*text, remote::limits::textBytes) : std::nullopt;
}

} // namespace

void postTraits(wl_resource *view, const remote::Traits &traits)
{
    const auto number = [](auto value) { return static_cast<std::uint32_t>(value); };
    favrin_remote_view_v1_send_presentation_context(view, number(traits.presentationContext));
    favrin_remote_view_v1_send_appearance(view, number(traits.appearance));
    favrin_remote_view_v1_send_layout_direction(view, number(traits.layoutDirection));
    favrin_remote_view_v1_send_text_size_category(view, number(traits.textSizeCategory));
    favrin_remote_view_v1_send_display(view, number(traits.displayGamut), traits.displayIdentifier.c_str());
    favrin_remote_view_v1_send_locale(view, traits.locale.c_str());
    favrin_remote_view_v1_send_accessibility_options(view, remote::accessibilityBits(traits));
    favrin_remote_view_v1_send_traits_done(view);
}

void postSelectedColor(wl_resource *view, const std::optional<platform::Color> &color,
                       const std::optional<std::string> &colorspace)
{
    const auto wire = remote::encodeColor(color);
    if (!wire)
        return;
    wl_array numbers = arrayOf(wire->numbers);
    favrin_remote_view_v1_send_set_selected_color(view, &numbers, orNull(wire->space), orNull(sendable(colorspace)));
}

ConfigurationMessages::ConfigurationMessages(const remote::Configuration &configuration)
    : m_configuration(configuration)
{
    if (configuration.suggestedColors)
        m_runs = remote::encodeColorRuns(*configuration.suggestedColors);
}

std::size_t ConfigurationMessages::bytes() const
{
    constexpr std::size_t fixedPart = 256;
    constexpr std::size_t perMessage = 24;
    std::size_t sum = fixedPart + (m_configuration.title ? m_configuration.title->size() : 0);
    for (const remote::WireColorRun &run : m_runs)
        sum += perMessage + run.space.size() + run.numbers.size() * sizeof(double);
    return sum;
}

void ConfigurationMessages::post(wl_resource *view) const
{
    if (m_configuration.title)
        favrin_remote_view_v1_send_title(view, m_configuration.title->c_str());
    for (const remote::WireColorRun &run : m_runs) {
        wl_array numbers = arrayOf(run.numbers);
        favrin_remote_view_v1_send_suggested_colors(view, run.space.c_str(), &numbers);
    }
    favrin_remote_view_v1_send_options(view, remote::optionBits(m_configuration));
    favrin_remote_view_v1_send_grid_style(view, m_configuration.userInterfaceStyleForGrid);
    const std::array geometry = {m_configuration.hostWindowWidth, m_configuration.hostWindowHeight,
                                 m_configuration.keyboardSpace};
    wl_array numbers = arrayOf(geometry);
    favrin_remote_view_v1_send_host_window(view, &numbers);
    favrin_remote_view_v1_send_configuration_done(view);
}

} // namespace favrin::host::server
