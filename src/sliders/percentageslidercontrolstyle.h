#pragma once

#include "platform/text/numberformatter.h"
#include "sliders/slidercontrolstyle.h"

namespace favrin::sliders {

/** A component as a whole percentage, written as the locale writes it. Only its digits are read. */
struct PercentageSliderControlStyle : SliderControlStyle
{
    /** In the current locale. The formatters of the process are made on first use and kept. */
    PercentageSliderControlStyle();
    /**
     * @param formatter percentages, and
     * @param parser whole numbers; both must outlive the style and its copies
     */
    PercentageSliderControlStyle(const platform::NumberFormatter &formatter, const platform::NumberFormatter &parser);
};

} // namespace favrin::sliders
