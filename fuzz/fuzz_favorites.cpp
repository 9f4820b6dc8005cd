#include "fuzzinput.h"
#include "model/colorcoding.h"

#include <cmath>

using namespace favrin::model;

int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    FuzzInput input(data, size);
    const auto json = input.rest();
    static_cast<void>(decodedColor(json));
    const auto decoded = decodedColors(json);
    const auto *colors = std::get_if<std::vector<SomeColor>>(&decoded);
    if (!colors)
        return 0;
    for (const auto &color : *colors) {
        for (const double number : {color.r, color.g, color.b, color.a})
            require(std::isfinite(number), "numbers are finite");
    }
    const auto encoded = encodedColors(*colors);
    const auto *text = std::get_if<std::string>(&encoded);
    require(text, "what was read can be written");
    const auto again = decodedColors(*text);
    const auto *same = std::get_if<std::vector<SomeColor>>(&again);
    require(same && *same == *colors, "written and read it is the same");
    return 0;
}
