#include "service/colorpickerlog.h"

namespace favrin::service {

const platform::Log &colorPickerLog()
{
    static const platform::Log log("com.quenta.favrin.ColorPicker", "ColorPicker");
    return log;
}

} // namespace favrin::service
