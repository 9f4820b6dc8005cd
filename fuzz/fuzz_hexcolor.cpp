#include "fuzzinput.h"
#include "model/hexcolor.h"

using namespace favrin::model;

int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    FuzzInput input(data, size);
    const bool isWide = input.number<std::uint8_t>() % 2 == 1;
    const auto rest = input.rest();
    const auto text = isWide ? utf16({data + 1, rest.size()}) : widened(rest);
    HexColorError error;
    const auto color = hexValuedColor(text, platformName(SomeColor::ColorSpace::displayP3), &error);
    require(color.has_value() != (error.code != 0 || !error.domain.empty()), "a color or a reason");
    if (!color)
        return 0;
    for (const double component : {color->r, color->g, color->b})
        require(component >= 0 && component <= 1, "components are in 0…1");
    require(color->a == 1 && color->colorSpace == SomeColor::ColorSpace::displayP3,
            "opaque, in the space of the field");
    const auto written = hexString(*color);
    require(hexValuedColor(widened(written), platformName(color->colorSpace)) == color,
            "written and read it is the same");
    return 0;
}
