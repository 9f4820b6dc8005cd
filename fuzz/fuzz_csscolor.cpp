#include "fuzzinput.h"
#include "model/csscolor.h"

#include <cmath>

using namespace favrin::model;

int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    FuzzInput input(data, size);
    const auto color = colorFromCssText(input.rest(), SomeColor::ColorSpace::displayP3);
    if (!color)
        return 0;
    for (const double component : {color->r, color->g, color->b, color->a})
        require(component >= 0 && component <= 1, "components are in 0…1");
    return 0;
}
