#include "host/fvcolorpickerviewcontroller.h"

// There is no process to start ahead, and no file that would be run.

void FVColorPickerViewController::startServiceAhead() {}

QString FVColorPickerViewController::servicePath()
{
    return {};
}
