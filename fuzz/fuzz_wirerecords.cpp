#include "fuzzinput.h"
#include "remote/limits.h"
#include "remote/sanitized.h"
#include "remote/wirecolor.h"
#include "remote/wireoptions.h"
#include "remote/wiretext.h"

#include <cmath>

using namespace favrin::remote;

namespace {

Color colorFrom(FuzzInput &input)
{
    const std::array<double, 3> components = {input.number<double>(), input.number<double>(), input.number<double>()};
    return {favrin::platform::ColorSpace::named(input.text()), components, input.number<double>()};
}

void checkColors(FuzzInput &input)
{
    const auto run = input.run(8);
    const auto space = input.text();
    const auto color = decodeColor(std::as_bytes(run), space);
    if (color && *color) {
        require(isFinite(**color), "a color from the wire is finite");
        const auto sent = encodeColor(*color);
        require(sent.has_value(), "a color from the wire can be sent");
        const auto again = decodeColor(std::as_bytes(std::span(sent->numbers)),
                                       sent->space ? std::optional<std::string_view>(*sent->space) : std::nullopt);
        require(again && *again && **again == **color, "sent and received it is the same");
    }
    if (const auto colors = decodeColorRun(std::as_bytes(run), space))
        require(colors->size() <= limits::colorsPerEvent, "a run is limited");
    const std::array colors = {colorFrom(input), colorFrom(input)};
    for (const auto &sent : encodeColorRuns(colors))
        require(decodeColorRun(std::as_bytes(std::span(sent.numbers)), sent.space).has_value(),
                "what is sent can be received");
}

void checkTexts(FuzzInput &input)
{
    const auto text = input.text(4);
    if (const auto sent = sendableText(text, limits::textBytes))
        require(isWireText(*sent, limits::textBytes), "what is sent is a text");
    else
        require(!isWireText(text), "a text can be sent");
}

void checkRecords(FuzzInput &input)
{
    Traits traits;
    traits.presentationContext = static_cast<PresentationContext>(input.number<std::uint32_t>());
    traits.appearance = static_cast<Appearance>(input.number<std::uint32_t>());
    traits.layoutDirection = static_cast<LayoutDirection>(input.number<std::uint32_t>());
    traits.textSizeCategory = static_cast<TextSizeCategory>(input.number<std::uint32_t>());
    traits.displayGamut = static_cast<DisplayGamut>(input.number<std::uint32_t>());
    traits.displayIdentifier = input.text();
    traits.locale = input.text();
    applyAccessibilityBits(input.number<std::uint32_t>(), traits);
    const auto saneTraits = sanitized(traits);
    require(sanitized(saneTraits) == saneTraits, "sane traits stay as they are");
    require(isWireText(saneTraits.locale, limits::textBytes), "a sane locale is a text");

    Configuration configuration;
    configuration.title = input.text(8);
    configuration.suggestedColors = {colorFrom(input), colorFrom(input), colorFrom(input)};
    configuration.hostWindowWidth = input.number<double>();
    configuration.hostWindowHeight = input.number<double>();
    configuration.keyboardSpace = input.number<double>();
    applyOptionBits(input.number<std::uint32_t>(), configuration);
    const auto sane = sanitized(configuration);
    require(sanitized(sane) == sane, "a sane configuration stays as it is");
    for (const double length : {sane.hostWindowWidth, sane.hostWindowHeight, sane.keyboardSpace})
        require(length >= 0 && length <= limits::largestSize, "sane lengths are in range");
}

} // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    FuzzInput input(data, size);
    checkColors(input);
    checkTexts(input);
    checkRecords(input);
    return 0;
}
