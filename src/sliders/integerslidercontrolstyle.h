#pragma once

#include "platform/text/numberformatter.h"
#include "sliders/slidercontrolstyle.h"

namespace favrin::sliders {

/** A component as a whole number from 0 to 255 with the digits of the locale. At most three digits can be typed. */
struct IntegerSliderControlStyle : SliderControlStyle
{
    /** In the current locale. The formatter of the process is made on first use and kept. */
    IntegerSliderControlStyle();
    /** @param formatter whole numbers; it must outlive the style and its copies */
    explicit IntegerSliderControlStyle(const platform::NumberFormatter &formatter);
};

} // namespace favrin::sliders
