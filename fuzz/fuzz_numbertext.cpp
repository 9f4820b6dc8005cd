#include "fuzzinput.h"
#include "platform/text/numberformatter.h"

#include <array>
#include <cmath>

using favrin::platform::NumberFormatter;
using Style = NumberFormatter::Style;

int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    static const std::array<NumberFormatter, 10> formatters = {{
        {Style::Integer, "en"},
        {Style::Percent, "en"},
        {Style::Integer, "ar-EG"},
        {Style::Percent, "ar-EG"},
        {Style::Percent, "de"},
        {Style::Percent, "fr"},
        {Style::Integer, "hi-u-nu-deva"},
        {Style::Percent, "tr"},
        {Style::Percent, "eu"},
        {Style::Integer, "no such language"},
    }};
    FuzzInput input(data, size);
    const auto choice = input.number<std::uint8_t>();
    const auto &formatter = formatters[choice % formatters.size()];
    const auto rest = input.rest();
    const auto text = choice >= 128 ? utf16({data + 1, rest.size()}) : widened(rest);
    const auto number = formatter.number(text);
    if (!number)
        return 0;
    require(!std::isnan(*number), "a number is a number");
    // What the fields show: within their range every number that is shown can be typed.
    if (std::abs(*number) > 1e6)
        return 0;
    const auto shown = formatter.string(*number);
    require(shown.has_value(), "what was read can be written");
    const auto again = formatter.number(*shown);
    require(again && formatter.string(*again) == shown, "what is shown can be read");
    return 0;
}
